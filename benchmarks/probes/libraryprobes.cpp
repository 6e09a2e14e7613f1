#include "libraryprobes.h"

#include "logginglevel.h"
#include "probe.h"
#include "siblingprobes.h"

#include "checksum.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <memory>
#include <vector>

namespace {

using namespace HmiStateMachine;

FlowShape twoViews()
{
    FlowShape shape;
    shape.views = 2;
    return shape;
}

/** One operation is one view request. */
class ViewRequests : public Library::ShapeFlow
{
public:
    ViewRequests() : ShapeFlow(twoViews()) { }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_next = 1 - m_next;
            requestView(screens().at(m_next), i);
        }
    }

private:
    int m_next = 0;
};

FlowShape viewsByScreen(int views)
{
    FlowShape shape;
    shape.views = views;
    shape.byScreen = true;
    return shape;
}

/** A state comes to be and goes before each request for a view by its screen. */
class ChangingFlow : public Library::ShapeFlow
{
public:
    explicit ChangingFlow(int views) : ShapeFlow(viewsByScreen(views)) { }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            const NamedState state(QStringLiteral("Passing"));
            m_next = 1 - m_next;
            requestView(screens().at(m_next), i);
        }
    }

private:
    int m_next = 0;
};

/** Every view that is left and entered is watched by other states. */
class Monitored : public ViewRequests
{
public:
    explicit Monitored(int monitors)
    {
        for (int i = 0; i < monitors; ++i) {
            m_monitors.push_back(std::make_unique<NamedState>());
            for (const QString &name : screens()) {
                NamedState::stateForName(name)->registerMonitoringState(m_monitors.back().get());
            }
        }
    }

private:
    std::vector<std::unique_ptr<NamedState>> m_monitors;
};

/** The library says more or less of what it does while it does it. */
class Logged : public ViewRequests
{
public:
    explicit Logged(LoggingLevel level) : m_level(level) { }

    void before(int operations) override
    {
        ViewRequests::before(operations);
        setLoggingLevel(m_level);
    }

    void after() override
    {
        setLoggingLevel(LoggingLevel::Warnings);
        ViewRequests::after();
    }

private:
    LoggingLevel m_level;
};

/** Asks the interruption store what only a rule with wildcards answers. */
class WildcardLookup : public Flow
{
public:
    explicit WildcardLookup(int rules)
    {
        for (int i = 0; i < rules; ++i) {
            const QString popup = QStringLiteral("Popup%1").arg(i);
            m_store.insertInterruptionBehavior(PopupState::Prohibit, QStringLiteral("*/") + popup,
                                               QStringLiteral("Source/*"));
            m_popups.append(QStringLiteral("Module/") + popup);
        }
    }

    void run(int operations) override
    {
        const QString requested = QStringLiteral("Source/Message");
        for (int i = 0; i < operations; ++i) {
            m_next = nextIndex(m_next, m_popups.size());
            m_checksum.add(m_store.getInterruptionBehavior(m_popups.at(m_next), requested));
        }
    }

    quint64 checksum() const override { return m_checksum.value(); }

private:
    PopupInterruptionStore m_store;
    QStringList m_popups;
    int m_next = 0;
    Checksum m_checksum;
};

QVector<Workload> loggingProbes()
{
    const auto engine = Engine::Library;
    return {probe<Logged>(engine, QStringLiteral("P-logging/warnings"),
                          QStringLiteral("view switch, debug output off"), oneLayout,
                          LoggingLevel::Warnings),
            probe<Logged>(engine, QStringLiteral("P-logging/asked"),
                          QStringLiteral("view switch, entries asked for, debug output off"),
                          oneLayout, LoggingLevel::Asked),
            probe<Logged>(engine, QStringLiteral("P-logging/debug"),
                          QStringLiteral("view switch, debug output on"), oneLayout,
                          LoggingLevel::Debug),
            probe<Logged>(engine, QStringLiteral("P-logging/entries"),
                          QStringLiteral("view switch, debug output on with every entry and exit"),
                          oneLayout, LoggingLevel::Entries)};
}

} // namespace

QVector<Workload> libraryProbes()
{
    const auto engine = Engine::Library;
    return probes<Monitored>(engine, QStringLiteral("P-monitors"),
                             QStringLiteral("view switch, %1 monitors on each view"), oneLayout,
                             {0, 10, 100})
        + probes<ChangingFlow>(engine, QStringLiteral("P-screen-ids"),
                               QStringLiteral("view switch by a screen id after a state has come "
                                              "and gone, %1 views"),
                               oneLayout, {10, 100, 1000})
        + probes<WildcardLookup>(engine, QStringLiteral("P-wildcards"),
                                 QStringLiteral("interruption lookup among %1 wildcards"),
                                 oneLayout, {10, 100, 1000})
        + siblingProbes() + loggingProbes();
}
