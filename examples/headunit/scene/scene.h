#pragma once

#include <QImage>
#include <QQmlApplicationEngine>

#include <memory>
#include <optional>

class QQuickWindow;

namespace headunit {

class Inspector;
class SceneClock;
class Vehicle;
class ViewLayer;
struct Fault;

/** The face of the head unit in a window of its own. */
class Scene
{
public:
    enum Time {
        RunningTime, ///< animations run as time passes
        OwnTime ///< animations run when the scene settles
    };

    Scene(Vehicle *vehicle, ViewLayer *viewLayer, Inspector *inspector, Time time);
    ~Scene();

    /** Opens the window, with the panels for developers or without, and waits until it is there. */
    std::optional<Fault> open(bool panelsShown);

    /**
     * Lets everything that moves come to its end; needs a time of its own. With @p visibly at the
     * pace at which a person sees it.
     */
    std::optional<Fault> settle(bool visibly);

    /** Draws the window as it is now. */
    void draw();
    QImage picture() const;
    QQuickWindow *window() const;

private:
    Q_DISABLE_COPY(Scene)

    ViewLayer *m_viewLayer;
    std::unique_ptr<SceneClock> m_clock;
    QQmlApplicationEngine m_engine;
};

} // namespace headunit
