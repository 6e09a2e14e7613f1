#include "cockpit.h"
#include "rules.h"
#include "scenario/scenariorunner.h"
#include "scene/spectator.h"
#include "seenbyuser.h"

#include <HmiStateMachine/named/statemachine.h>

#include <QFile>
#include <QGuiApplication>
#include <QMap>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QSet>
#include <QTest>

#include <unistd.h>

using namespace headunit;
using HmiStateMachine::StateMachine;

namespace {

constexpr int roundsToBegin = 20; // until the log of requests and all caches are full
constexpr int rounds = 200;

using Census = QMap<QString, int>; // objects by class

// An item's children need not be its QObject's, and the other way round.
void visit(const QObject *object, QSet<const QObject *> *seen)
{
    if (!object || seen->contains(object)) {
        return;
    }
    seen->insert(object);
    for (const QObject *child : object->children()) {
        visit(child, seen);
    }
    if (const auto *item = qobject_cast<const QQuickItem *>(object)) {
        const auto items = item->childItems();
        for (const QQuickItem *child : items) {
            visit(child, seen);
        }
    }
}

Census takeCensus(const QList<const QObject *> &roots)
{
    QSet<const QObject *> seen;
    for (const QObject *root : roots) {
        visit(root, &seen);
    }
    Census census;
    for (const QObject *object : qAsConst(seen)) {
        ++census[object->metaObject()->className()];
        census["scene items"] += qobject_cast<const QQuickItem *>(object) ? 1 : 0;
    }
    census["all"] = seen.size();
    return census;
}

// What there is more or less of: "3 QTimer, -1 QQuickText"; empty when nothing has changed.
QString difference(const Census &before, const Census &after)
{
    QStringList lines;
    QStringList names = before.keys() + after.keys();
    names.removeDuplicates();
    for (const QString &name : names) {
        const int change = after.value(name) - before.value(name);
        if (change != 0) {
            lines.append(QString("%1 %2").arg(change).arg(name));
        }
    }
    lines.sort();
    return lines.join(", ");
}

double residentMegabytes()
{
    QFile file("/proc/self/statm");
    const QByteArray text = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    return text.split(' ').value(1).toDouble() * double(sysconf(_SC_PAGESIZE)) / (1024 * 1024);
}

} // namespace

class tst_SceneGrowth : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void roundsLeaveNothingBehind();

private:
    Census census() const;
    std::optional<LocatedFault> drive(int number);

    std::unique_ptr<Cockpit> m_cockpit;
    std::unique_ptr<Spectator> m_spectator;
    std::unique_ptr<ScenarioRunner> m_runner;
    QVector<Command> m_round;
};

void tst_SceneGrowth::initTestCase()
{
    m_cockpit = std::make_unique<Cockpit>(scenarioTiming, Scene::OwnTime);
    QVERIFY(!loadRules(builtInRules()));
    m_round = Cockpit::readScenario(ROUND);
    QVERIFY(!m_round.isEmpty());
    QVERIFY(!m_cockpit->scene->open(false));
    m_cockpit->scene->window()->resize(170, 90); // is drawn in no time
    m_spectator = std::make_unique<Spectator>(m_cockpit->scene.get(), m_cockpit->inspector.get(),
                                              &m_cockpit->viewLayer, Spectator::Options());
    m_runner = std::make_unique<ScenarioRunner>(m_cockpit->stage(), m_spectator.get());
    m_cockpit->vehicle.setReady(true);
    m_cockpit->vehicle.setPhoneConnected(true);
    QVERIFY(!m_runner->start());
    QCOMPARE(m_cockpit->viewLayer.activeView(), HmiStateMachine::Identifier("Home/Main"));
}

void tst_SceneGrowth::roundsLeaveNothingBehind()
{
    auto fault = drive(roundsToBegin);
    QVERIFY2(!fault, fault ? qPrintable(faultText(ROUND, *fault)) : "");
    const Census before = census();
    const double megabytesBefore = residentMegabytes();

    fault = drive(rounds - roundsToBegin);

    QVERIFY2(!fault, fault ? qPrintable(faultText(ROUND, *fault)) : "");
    const Census after = census();
    qInfo("%d objects, %d of them items; resident %.1f MB, then %.1f MB", after["all"],
          after["scene items"], megabytesBefore, residentMegabytes());
    QVERIFY(before["scene items"] > 100);
    QCOMPARE(difference(before, after), QString());
}

Census tst_SceneGrowth::census() const
{
    const QQuickWindow *window = m_cockpit->scene->window();
    QQmlEngine *engine = qmlEngine(window);
    engine->collectGarbage();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return takeCensus({QCoreApplication::instance(), engine, window, window->contentItem(),
                       StateMachine::instance(), &m_cockpit->viewLayer, &m_cockpit->vehicle,
                       m_cockpit->inspector.get()});
}

std::optional<LocatedFault> tst_SceneGrowth::drive(int number)
{
    for (int i = 0; i < number; ++i) {
        if (const auto fault = m_runner->run(m_round)) {
            return fault;
        }
    }
    return std::nullopt;
}

int main(int argc, char *argv[])
{
    qputenv("QSG_RENDER_LOOP", "basic"); // as the program has it
    QGuiApplication app(argc, argv);
    tst_SceneGrowth test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_scenegrowth.moc"
