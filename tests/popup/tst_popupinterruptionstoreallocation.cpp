#include "interruptions.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QtTest>

#include <atomic>
#include <cstdlib>
#include <memory>

using namespace HmiStateMachine;

namespace {

std::atomic<bool> s_counting(false);
std::atomic<int> s_allocations(0);

void countAllocation()
{
    if (s_counting) {
        ++s_allocations;
    }
}

} // namespace

// The program's own allocator, which every library in the process is bound to; operator new ends
// here, too. What it hands out is the C library's, whose free() takes it back.
extern "C" {
void *__libc_malloc(size_t size);
void *__libc_calloc(size_t count, size_t size);
void *__libc_realloc(void *block, size_t size);

Q_DECL_EXPORT void *malloc(size_t size) noexcept
{
    countAllocation();
    return __libc_malloc(size);
}

Q_DECL_EXPORT void *calloc(size_t count, size_t size) noexcept
{
    countAllocation();
    return __libc_calloc(count, size);
}

Q_DECL_EXPORT void *realloc(void *block, size_t size) noexcept
{
    countAllocation();
    return __libc_realloc(block, size);
}
}

namespace {

template <typename Action> int allocationsOf(Action action)
{
    s_allocations = 0;
    s_counting = true;
    action();
    s_counting = false;
    return s_allocations;
}

// Rules and blacklists for one popup exactly, for one in any module and for one module.
constexpr char rules[] = R"([
    {"popup": "phone/call", "default": "Allow", "domainBlacklist": ["media"],
     "viewBlacklist": ["Map"],
     "interruptions": [{"target": "car/fuel", "behavior": "Prohibit"},
                       {"target": "*/door", "behavior": "Prohibit"},
                       {"target": "radio/*", "behavior": "Prohibit"}]},
    {"popup": "*/news", "domainBlacklist": ["media"], "viewBlacklist": ["Map"],
     "interruptions": [{"target": "*/door", "behavior": "Prohibit"}]},
    {"popup": "video/*", "domainBlacklist": ["media"], "viewBlacklist": ["Map"],
     "interruptions": [{"target": "radio/*", "behavior": "Prohibit"}]}])";

} // namespace

/** A request for a popup asks the store several times, and must not cost memory for it. */
class tst_PopupInterruptionStoreAllocation : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void allocationsAreCounted();
    void aLookupAllocatesNothing_data();
    void aLookupAllocatesNothing();
};

void tst_PopupInterruptionStoreAllocation::allocationsAreCounted()
{
    QString text = "some";
    QString shared;
    std::unique_ptr<QObject> object;

    QCOMPARE(allocationsOf([&] { shared = text; }), 0);
    QVERIFY(allocationsOf([&] { text += "thing that needs more room"; }) > 0);
    QVERIFY(allocationsOf([&] { object.reset(new QObject); }) > 0);
    QVERIFY(allocationsOf([&] { shared = extractPopupWildCard("phone/call"); }) > 0);
}

void tst_PopupInterruptionStoreAllocation::aLookupAllocatesNothing_data()
{
    QTest::addColumn<int>("entries");
    QTest::addColumn<QString>("popup");
    QTest::addColumn<QString>("target");
    QTest::addColumn<bool>("found");

    for (int entries : {0, 10, 5000}) {
        const auto row = [entries](const char *tag, const char *popup, const char *target,
                                   bool found) {
            QTest::addRow("%s, beside %d", tag, entries) << entries << popup << target << found;
        };
        row("an exact entry", "phone/call", "car/fuel", true);
        row("a target in any module", "phone/call", "boat/door", true);
        row("a target's module", "phone/call", "radio/traffic", true);
        row("a popup in any module", "paper/news", "boat/door", true);
        row("a popup's module", "video/film", "radio/traffic", true);
        row("neither", "garden/gate", "kitchen/sink", false);
        row("a name without a slash", "gate", "sink", false);
        row("three parts", "garden/gate/lock", "kitchen/sink/tap", false);
        row("empty names", "", "", false);
    }
}

void tst_PopupInterruptionStoreAllocation::aLookupAllocatesNothing()
{
    QFETCH(int, entries);
    QFETCH(QString, popup);
    QFETCH(QString, target);
    QFETCH(bool, found);
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"media", 4}});
    layer.setActiveDomain(4);
    layer.setActiveView("Map");
    PopupInterruptionStore store;
    QVERIFY(loadInterruptions(store, rules));
    for (int i = 0; i < entries; ++i) {
        const QString number = QString::number(i);
        store.insertInterruptionBehavior(PopupState::AllowStack, "*/p" + number,
                                         "m" + number + "/*");
    }
    const QString view = "Map";
    const PopupState shown(popup, 1);
    const PopupState requested(target, 1);
    int hits = 0;

    const int allocations = allocationsOf([&] {
        hits += store.getInterruptionBehavior(popup, target) == PopupState::Prohibit;
        hits += store.getInterruptionBehavior(&shown, &requested) == PopupState::Prohibit;
        hits += store.isBlockedByDomain(popup, 4);
        hits += store.isBlockedByDomain(popup);
        hits += store.isBlockedByDomain(&shown, 4);
        hits += store.isBlockedByDomain(&shown);
        hits += store.isBlockedByView(popup, view);
        hits += store.isBlockedByView(popup);
        hits += store.isBlockedByView(&shown, view);
        hits += store.isBlockedByView(&shown);
    });

    QCOMPARE(allocations, 0);
    QCOMPARE(hits, found ? 10 : 0);
}

QTEST_GUILESS_MAIN(tst_PopupInterruptionStoreAllocation)
#include "tst_popupinterruptionstoreallocation.moc"
