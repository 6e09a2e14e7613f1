#pragma once

#include "flow/building.h"
#include "hardkeys.h"
#include "scenario/commands.h"
#include "scenario/scenarioparser.h"
#include "scene/inspector.h"
#include "scene/scene.h"
#include "transcript.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <cstdio>
#include <memory>

namespace headunit {

/** The head unit with its scene, as the program puts it together; its transcript goes nowhere. */
class Cockpit
{
public:
    /** Stands still until the machine is started; the window is opened by whoever tests. */
    Cockpit(const Timing &timing, Scene::Time time);
    ~Cockpit();

    Stage stage();

    /** The commands of a file; empty, with a message, when it is no scenario. */
    static QVector<Command> readScenario(const QString &path);

private:
    struct FileCloser
    {
        void operator()(FILE *file) const { std::fclose(file); }
    };

    Q_DISABLE_COPY(Cockpit)

    std::unique_ptr<FILE, FileCloser> m_nowhere;

public:
    Transcript transcript;
    ViewLayer viewLayer;
    Vehicle vehicle;
    HardKeys keys;
    std::unique_ptr<Inspector> inspector;
    std::unique_ptr<Scene> scene;
};

} // namespace headunit
