#include "scene.h"

#include "inspector.h"
#include "scenario/fault.h"
#include "sceneclock.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QFontDatabase>
#include <QGuiApplication>
#include <QQuickWindow>
#include <QThread>
#include <QTimer>

namespace headunit {

namespace {

constexpr int openingMs = 10000;
constexpr int maximumFrames = 1000; // sixteen seconds; no animation of the face takes one

// Any number of scenes shows the same objects.
template <typename T> void publish(const char *name, T *object)
{
    QQmlEngine::setObjectOwnership(object, QQmlEngine::CppOwnership);
    qmlRegisterSingletonInstance("HeadUnit", 1, 0, name, object);
}

void warnOfMissingFonts()
{
    const QStringList families = QFontDatabase().families();
    for (const char *family : {"Inter", "Material Icons"}) {
        if (!families.contains(family)) {
            qWarning("The font \"%s\" is not installed; scripts/demo installs it.", family);
        }
    }
}

bool waitUntilExposed(const QQuickWindow *window)
{
    QEventLoop loop;
    QTimer timeout; // goes with the loop, unlike one that is started by the static function
    QObject::connect(&timeout, &QTimer::timeout, &loop, &QEventLoop::quit);
    timeout.start(openingMs);
    QObject::connect(window, &QQuickWindow::frameSwapped, &loop, &QEventLoop::quit);
    loop.exec();
    return window->isExposed();
}

} // namespace

Scene::Scene(Vehicle *vehicle, ViewLayer *viewLayer, Inspector *inspector, Time time)
    : m_viewLayer(viewLayer)
{
    publish("Vehicle", vehicle);
    publish("Inspector", inspector);
    qmlRegisterAnonymousType<RequestLog>("HeadUnit", 1);
    if (time == OwnTime) {
        m_clock = std::make_unique<SceneClock>();
    }
    warnOfMissingFonts();
}

Scene::~Scene() = default;

std::optional<Fault> Scene::open(bool panelsShown)
{
    m_engine.setInitialProperties({{"panelsShown", panelsShown}});
    m_engine.load(QUrl("qrc:/face/Main.qml"));
    if (!window()) {
        return Fault{"the scene to load", "an error of its files", "the messages above name them"};
    }
    if (!waitUntilExposed(window())) {
        return Fault{"a window to be shown", "none within ten seconds", "look at the display"};
    }
    return std::nullopt;
}

std::optional<Fault> Scene::settle(bool visibly)
{
    for (int frame = 0; m_viewLayer->isTransitioning(); ++frame) {
        if (frame == maximumFrames) {
            return Fault{"the scene to come to rest", "something that moves on and on", QString()};
        }
        m_clock->tick();
        QCoreApplication::sendPostedEvents();
        if (visibly) {
            draw();
            QThread::msleep(SceneClock::frameMs());
        }
    }
    return std::nullopt;
}

void Scene::draw()
{
    QEvent frame(QEvent::UpdateRequest);
    QCoreApplication::sendEvent(window(), &frame);
    QGuiApplication::sync();
}

QImage Scene::picture() const
{
    return window()->grabWindow();
}

QQuickWindow *Scene::window() const
{
    return qobject_cast<QQuickWindow *>(m_engine.rootObjects().value(0));
}

} // namespace headunit
