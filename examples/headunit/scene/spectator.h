#pragma once

#include "flowpause.h"
#include "scenario/audience.h"

#include <QString>

#include <functional>

namespace headunit {

class Inspector;
class Scene;

/** Shows a scenario in the scene, step by step, and takes a picture of each. */
class Spectator : public Audience
{
public:
    struct Options
    {
        QString folder; ///< of the pictures; none are taken when it is empty
        int paceMs = 0; ///< for how long each step can be looked at
        std::function<void(const QString &step, const QString &file)> taken;
    };

    /** All of these outlive it. */
    Spectator(Scene *scene, Inspector *inspector, QObject *viewLayer, const Options &options);

    void commandBegins(const Command &command) override;
    std::optional<Fault> settle() override;
    std::optional<Fault> commandEnds(const Command &command) override;

private:
    Q_DISABLE_COPY(Spectator)

    std::optional<Fault> takePicture(const QString &step);

    Scene *m_scene;
    Inspector *m_inspector;
    Options m_options;
    FlowPause m_pause;
    int m_pictures = 0;
};

} // namespace headunit
