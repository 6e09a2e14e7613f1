#include "cockpit.h"
#include "options.h"
#include "rules.h"
#include "scenario/audience.h"
#include "scenario/scenariorunner.h"
#include "scene/spectator.h"
#include "seenbyuser.h"

#include <QGuiApplication>
#include <QQuickWindow>
#include <QTest>

using namespace headunit;

namespace {

/** Looks at the scene after each command, with the flow's time still standing. */
class Watcher : public Audience
{
public:
    Watcher(Spectator *spectator, const Scene *scene, const ViewLayer *viewLayer)
        : m_spectator(spectator), m_scene(scene), m_viewLayer(viewLayer)
    {
    }

    void commandBegins(const Command &command) override { m_spectator->commandBegins(command); }

    std::optional<Fault> settle() override { return m_spectator->settle(); }

    std::optional<Fault> commandEnds(const Command &command) override
    {
        if (const auto fault = m_spectator->commandEnds(command)) {
            return fault;
        }
        ++m_steps;
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); // what has moved out
        const QString wrong = wrongInScene(m_scene->window(), m_viewLayer);
        if (wrong.isEmpty()) {
            return std::nullopt;
        }
        return Fault{"the scene to show what the flow wants", wrong, QString()};
    }

    int steps() const { return m_steps; }

private:
    Spectator *m_spectator;
    const Scene *m_scene;
    const ViewLayer *m_viewLayer;
    int m_steps = 0;
};

} // namespace

/** One scenario, named on the command line with its options. */
class tst_SceneScenario : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void userSeesAfterEachStepWhatTheFlowWants();
};

void tst_SceneScenario::userSeesAfterEachStepWhatTheFlowWants()
{
    Options options;
    QCOMPARE(parseOptions(QCoreApplication::arguments(), &options), QString());
    Cockpit cockpit(scenarioTiming, Scene::OwnTime);
    QVERIFY(!loadRules(options.rules));
    cockpit.vehicle.setFirstStart(options.firstStart);
    const auto commands = Cockpit::readScenario(options.scenario);
    QVERIFY(!commands.isEmpty());
    QVERIFY(!cockpit.scene->open(options.panels));
    Spectator spectator(cockpit.scene.get(), cockpit.inspector.get(), &cockpit.viewLayer, {});
    Watcher watcher(&spectator, cockpit.scene.get(), &cockpit.viewLayer);
    ScenarioRunner runner(cockpit.stage(), &watcher);

    QVERIFY(!runner.start());
    const auto fault = runner.run(commands);

    QVERIFY2(!fault, fault ? qPrintable(faultText(options.scenario, *fault)) : "");
    QVERIFY(watcher.steps() > 0);
}

int main(int argc, char *argv[])
{
    qputenv("QSG_RENDER_LOOP", "basic"); // as the program has it
    QGuiApplication app(argc, argv);
    tst_SceneScenario test;
    return QTest::qExec(&test, {app.applicationName()});
}

#include "tst_scenescenario.moc"
