#include "librarytest.h"
#include "seeds.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QChildEvent>
#include <QtTest>

#include <functional>
#include <memory>
#include <vector>

using namespace HmiStateMachine;

namespace {

constexpr int defaultSteps = 5000;
constexpr int mostStates = 60;

// Names and targets come from one list, so that each may be the other's; most targets come from
// its beginning, so that many states share one.
constexpr int idCount = 64;
constexpr int commonTargets = 5;

QString idOf(int number)
{
    return number == 0 ? QString() : "id" + QString::number(number);
}

template <typename State> using TargetOf = QString (State::*)() const;

/** The first state of the registry with @p target, as a walk finds it. */
template <typename State> State *firstWith(const QString &target, TargetOf<State> targetOf)
{
    const auto states = NamedState::namedStates();
    for (NamedState *named : states) {
        auto *state = qobject_cast<State *>(named);
        if (state && (state->*targetOf)() == target) {
            return state;
        }
    }
    return nullptr;
}

HmiViewState *walkToView(const QString &id)
{
    if (auto *view = qobject_cast<HmiViewState *>(NamedState::stateForName(id))) {
        return view;
    }
    return id.isEmpty() ? nullptr : firstWith(id, &HmiViewState::targetView);
}

PopupState *walkToPopup(const QString &id)
{
    if (auto *popup = qobject_cast<PopupState *>(NamedState::stateForName(id))) {
        return popup;
    }
    return firstWith(id, &PopupState::popupViewId);
}

// The first answer after a change comes from a walk, and the next one from an index.
template <typename State> State *bothAnswers(State *first, State *second, const QString &id)
{
    if (first != second) {
        qFatal("\"%s\" finds one state first and another one then", qPrintable(id));
    }
    return first;
}

HmiViewState *viewFor(const QString &id)
{
    HmiViewState *const first = HmiViewState::stateForTarget(id);
    return bothAnswers(first, HmiViewState::stateForTarget(id), id);
}

PopupState *popupFor(const QString &id)
{
    PopupState *const first = PopupState::stateForTarget(id);
    return bothAnswers(first, PopupState::stateForTarget(id), id);
}

QString text(const NamedState *state)
{
    return state ? state->metaObject()->className() + QString(" named \"%1\"").arg(state->name())
                 : QString("nothing");
}

/** States that come, go and change their ids at random. */
class RandomStates
{
public:
    explicit RandomStates(quint32 seed) : m_random(seed) { }

    ~RandomStates()
    {
        while (!m_states.empty()) {
            destroy(0);
        }
    }

    /** Changes something, and tells what. */
    QString step()
    {
        if (m_states.empty() || (m_random.oneIn(4) && m_states.size() < mostStates)) {
            return construct();
        }
        const int index = m_random.below(static_cast<int>(m_states.size()));
        const QString about = text(m_states[static_cast<std::size_t>(index)].get());
        return change(index) + " of " + about;
    }

    /** Looks some ids up; empty when all answers are those of a walk. */
    QString firstWrongAnswer()
    {
        for (int count = m_random.below(5); count > 0; --count) {
            const QString id = m_random.oneIn(3) ? anyId() : targetId();
            const QString wrong = compared("view", id, viewFor(id), walkToView(id))
                + compared("popup", id, popupFor(id), walkToPopup(id));
            if (!wrong.isEmpty()) {
                return wrong;
            }
        }
        return QString();
    }

private:
    static QString compared(const char *what, const QString &id, const NamedState *found,
                            const NamedState *expected)
    {
        return found == expected ? QString()
                                 : QString("the %1 of \"%2\" is %3 instead of %4 ")
                                       .arg(what, id, text(found), text(expected));
    }

    QString anyId() { return idOf(m_random.below(idCount)); }
    QString targetId() { return m_random.oneIn(4) ? anyId() : idOf(m_random.below(commonTargets)); }

    QString construct()
    {
        const QString name = anyId();
        const QString target = targetId();
        switch (m_random.below(5)) {
        case 0:
            m_states.emplace_back(new NamedState(name));
            break;
        case 1:
        case 2: {
            auto *popup = new PopupState(name, 1);
            m_states.emplace_back(popup);
            if (m_random.oneIn(2)) {
                popup->setPopupViewId(target);
            }
            break;
        }
        default:
            m_states.emplace_back(new HmiViewState(target, name));
            break;
        }
        return "construction of " + name + " with " + target;
    }

    QString change(int index)
    {
        NamedState *state = m_states[static_cast<std::size_t>(index)].get();
        const QString id = anyId();
        switch (m_random.below(7)) {
        case 0:
        case 1:
            destroy(index);
            return "destruction";
        case 2:
            state->setName(id);
            return "new name " + id;
        case 3:
            state->setNameNonHashing(id);
            return "unregistered name " + id;
        case 4:
            NamedState::hash(id, state);
            return "registration as " + id;
        case 5:
            NamedState::removeFromHash(id);
            return "end of the name " + id + " instead";
        default:
            return changePopupViewId(qobject_cast<PopupState *>(state));
        }
    }

    QString changePopupViewId(PopupState *popup)
    {
        const QString target = targetId();
        if (popup) {
            popup->setPopupViewId(target);
        }
        return "new popup view id " + target;
    }

    // A state knows its own name alone: what it was registered as by hand is given up by hand.
    void destroy(int index)
    {
        const auto at = m_states.begin() + index;
        for (int number = 1; number < idCount; ++number) {
            if (NamedState::stateForName(idOf(number)) == at->get()) {
                NamedState::removeFromHash(idOf(number));
            }
        }
        m_states.erase(at);
    }

    Random m_random;
    std::vector<std::unique_ptr<NamedState>> m_states;
};

/** Does something to a child that is just being made. */
class ChildWatch : public QObject
{
public:
    ChildWatch(QObject *parent, std::function<void(QObject *)> reaction)
        : m_reaction(std::move(reaction))
    {
        parent->installEventFilter(this);
    }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::ChildAdded) {
            m_reaction(static_cast<QChildEvent *>(event)->child());
        }
        return QObject::eventFilter(watched, event);
    }

private:
    std::function<void(QObject *)> m_reaction;
};

/** A popup with a view id other than its name. */
std::unique_ptr<PopupState> popupShownAs(const QString &viewId, const QString &name)
{
    auto popup = std::make_unique<PopupState>(name, 1);
    popup->setPopupViewId(viewId);
    return popup;
}

} // namespace

class tst_TargetLookup : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();

    void everyAnswerIsThatOfAWalk_data();
    void everyAnswerIsThatOfAWalk();

    void theRegistrysOrderDecidesBetweenViewsOfOneTarget();
    void theRegistrysOrderDecidesBetweenPopupsOfOneViewId();
    void aNameGoesBeforeATarget();
    void anotherKindOfStateOfThatNameHidesNoTarget();
    void anEmptyTargetFindsNoView();
    void anEmptyViewIdFindsThePopupThatHasIt();

    void aRenamedStateIsFoundByItsTarget();
    void aStateWithoutANameIsNotFound();
    void aStateOfAnUnregisteredNameIsNotFound();
    void aStateThatLostItsNameIsNotFoundUntilItTakesAnother();
    void aDestroyedStateLeavesItsTargetToTheNext();
    void aStateIsNotFoundOnItsDestruction();
    void aStateRegisteredByHandIsFoundUntilThatNameIsFreed();
    void anotherPopupViewIdHoldsFromThenOn();

    void aLookUpBeforeAnyStateHidesNone();
    void aLookUpWhileAViewIsMadeDoesNotHideIt();
    void aLookUpWhileAPopupIsMadeDoesNotHideIt();
};

// The order of the registry follows from it: a seed leads to the same steps in every process.
void tst_TargetLookup::initTestCase()
{
    qSetGlobalQHashSeed(0);
}

void tst_TargetLookup::everyAnswerIsThatOfAWalk_data()
{
    addSeedRows();
}

void tst_TargetLookup::everyAnswerIsThatOfAWalk()
{
    QFETCH(quint32, seed);
    messages().disableWarnings(); // of names that collide
    RandomStates states(seed);
    const int steps = numberOfSteps(defaultSteps);

    for (int step = 1; step <= steps; ++step) {
        const QString done = states.step();
        const QString wrong = states.firstWrongAnswer();

        QVERIFY2(wrong.isEmpty(),
                 qPrintable(QString("HMI_RANDOM_SEED=%1 HMI_RANDOM_STEPS=%2: after the %3, %4")
                                .arg(seed)
                                .arg(step)
                                .arg(done, wrong)));
    }
}

void tst_TargetLookup::theRegistrysOrderDecidesBetweenViewsOfOneTarget()
{
    std::vector<std::unique_ptr<NamedState>> states;
    QSet<HmiViewState *> found;
    for (int number = 0; number < 20; ++number) {
        states.push_back(std::make_unique<HmiViewState>("Map", "Map" + QString::number(number)));
    }

    for (int number = 0; number < 500; ++number) {
        states.push_back(std::make_unique<NamedState>("Other" + QString::number(number)));
        HmiViewState *const view = viewFor("Map");
        QCOMPARE(view, firstWith("Map", &HmiViewState::targetView));
        found.insert(view);
    }

    QVERIFY2(found.size() > 1, "The registry has to be ordered anew meanwhile.");
}

void tst_TargetLookup::theRegistrysOrderDecidesBetweenPopupsOfOneViewId()
{
    std::vector<std::unique_ptr<NamedState>> states;
    QSet<PopupState *> found;
    for (int number = 0; number < 20; ++number) {
        states.push_back(popupShownAs("Call", "Call" + QString::number(number)));
    }

    for (int number = 0; number < 500; ++number) {
        states.push_back(std::make_unique<NamedState>("Other" + QString::number(number)));
        PopupState *const popup = popupFor("Call");
        QCOMPARE(popup, firstWith("Call", &PopupState::popupViewId));
        found.insert(popup);
    }

    QVERIFY2(found.size() > 1, "The registry has to be ordered anew meanwhile.");
}

void tst_TargetLookup::aNameGoesBeforeATarget()
{
    HmiViewState shown("Map", "Shown");
    auto popup = popupShownAs("Call", "Phone");
    QCOMPARE(viewFor("Map"), &shown);
    QCOMPARE(popupFor("Call"), popup.get());

    HmiViewState named("Radio", "Map");
    auto namedPopup = popupShownAs("Fuel", "Call");

    QCOMPARE(viewFor("Map"), &named);
    QCOMPARE(popupFor("Call"), namedPopup.get());
    named.setName("Elsewhere");
    namedPopup->setName("Another");
    QCOMPARE(viewFor("Map"), &shown);
    QCOMPARE(popupFor("Call"), popup.get());
}

void tst_TargetLookup::anotherKindOfStateOfThatNameHidesNoTarget()
{
    const HmiViewState shown("Map", "Shown");
    const auto popup = popupShownAs("Map", "Phone");
    const NamedState plain("Map");

    QCOMPARE(viewFor("Map"), &shown);
    QCOMPARE(popupFor("Map"), popup.get());
}

void tst_TargetLookup::anEmptyTargetFindsNoView()
{
    const HmiViewState dummy(QString(), "Dummy");

    QCOMPARE(viewFor(QString()), nullptr);
    QCOMPARE(viewFor(""), nullptr);
}

void tst_TargetLookup::anEmptyViewIdFindsThePopupThatHasIt()
{
    const auto call = popupShownAs("Call", "Phone");
    QCOMPARE(popupFor(QString()), nullptr);

    const auto hidden = popupShownAs("", "Hidden");

    QCOMPARE(popupFor(QString()), hidden.get());
    QCOMPARE(popupFor(""), hidden.get());
}

void tst_TargetLookup::aRenamedStateIsFoundByItsTarget()
{
    HmiViewState view("Map", "First");
    const auto popup = popupShownAs("Call", "Phone");
    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(popupFor("Call"), popup.get());

    view.setName("Second");
    popup->setName("Telephone");

    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(viewFor("First"), nullptr);
    QCOMPARE(viewFor("Second"), &view);
    QCOMPARE(popupFor("Call"), popup.get());
    QCOMPARE(popupFor("Phone"), nullptr);
    QCOMPARE(popupFor("Telephone"), popup.get());
}

void tst_TargetLookup::aStateWithoutANameIsNotFound()
{
    HmiViewState view("Map", "View");
    const auto popup = popupShownAs("Call", "Phone");
    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(popupFor("Call"), popup.get());

    view.setName(QString());
    popup->setName(QString());

    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);
}

void tst_TargetLookup::aStateOfAnUnregisteredNameIsNotFound()
{
    HmiViewState view("Map", "View");
    const auto popup = popupShownAs("Call", "Phone");
    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(popupFor("Call"), popup.get());

    view.setNameNonHashing("Shared");
    popup->setNameNonHashing("Shared");

    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(viewFor("Shared"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);
    QCOMPARE(popupFor("Shared"), nullptr);
}

void tst_TargetLookup::aStateThatLostItsNameIsNotFoundUntilItTakesAnother()
{
    const HmiViewState holder("Radio", "Taken");
    HmiViewState view("Map", "Taken");
    PopupState popup("Taken", 1);
    popup.setPopupViewId("Call");
    QCOMPARE(messages().take().size(), 2);
    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);

    view.setName("View");
    popup.setName("Popup");

    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(popupFor("Call"), &popup);
    view.setName("Taken");
    popup.setName("Taken");
    QCOMPARE(messages().take().size(), 2);
    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);
}

void tst_TargetLookup::aDestroyedStateLeavesItsTargetToTheNext()
{
    std::vector<std::unique_ptr<NamedState>> states;
    for (int number = 0; number < 3; ++number) {
        states.push_back(std::make_unique<HmiViewState>("Map", "Map" + QString::number(number)));
        states.push_back(popupShownAs("Call", "Call" + QString::number(number)));
    }

    while (!states.empty()) {
        QVERIFY(viewFor("Map") || popupFor("Call"));
        QCOMPARE(viewFor("Map"), firstWith("Map", &HmiViewState::targetView));
        QCOMPARE(popupFor("Call"), firstWith("Call", &PopupState::popupViewId));
        states.erase(states.begin());
    }

    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);
}

void tst_TargetLookup::aStateIsNotFoundOnItsDestruction()
{
    auto view = std::make_unique<HmiViewState>("Map", "View");
    auto popup = popupShownAs("Call", "Phone");
    QVector<const NamedState *> found = {viewFor("Map"), popupFor("Call")};
    QCOMPARE(found, QVector<const NamedState *>({view.get(), popup.get()}));
    connect(view.get(), &QObject::destroyed, this, [&found] { found[0] = viewFor("Map"); });
    connect(popup.get(), &QObject::destroyed, this, [&found] { found[1] = popupFor("Call"); });

    view.reset();
    popup.reset();

    QCOMPARE(found, QVector<const NamedState *>({nullptr, nullptr}));
}

void tst_TargetLookup::aStateRegisteredByHandIsFoundUntilThatNameIsFreed()
{
    HmiViewState view("Map", QString());
    PopupState popup(QString(), 1);
    popup.setPopupViewId("Call");
    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);

    QVERIFY(NamedState::hash("ForeignView", &view));
    QVERIFY(NamedState::hash("ForeignPopup", &popup));

    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(popupFor("Call"), &popup);
    NamedState::removeFromHash("ForeignView");
    NamedState::removeFromHash("ForeignPopup");
    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);
}

void tst_TargetLookup::anotherPopupViewIdHoldsFromThenOn()
{
    PopupState popup("Phone", 1);
    QCOMPARE(popupFor("Call"), nullptr);

    popup.setPopupViewId("Call");
    QCOMPARE(popupFor("Call"), &popup);

    popup.setPopupViewId("Ring");
    QCOMPARE(popupFor("Call"), nullptr);
    QCOMPARE(popupFor("Ring"), &popup);
    QCOMPARE(popupFor("Phone"), &popup);
}

void tst_TargetLookup::aLookUpBeforeAnyStateHidesNone()
{
    QCOMPARE(viewFor("Map"), nullptr);
    QCOMPARE(popupFor("Call"), nullptr);

    const HmiViewState view("Map", "View");
    const auto popup = popupShownAs("Call", "Phone");

    QCOMPARE(viewFor("Map"), &view);
    QCOMPARE(popupFor("Call"), popup.get());
}

void tst_TargetLookup::aLookUpWhileAViewIsMadeDoesNotHideIt()
{
    QState parent;
    QVector<const NamedState *> found;
    const ChildWatch watch(&parent, [&found](QObject *) {
        found.append(NamedState::stateForName("View"));
        found.append(viewFor("Map"));
    });

    const auto *view = new HmiViewState("Map", "View", &parent);

    // It has its name by then, but is no view yet.
    QCOMPARE(found, QVector<const NamedState *>({view, nullptr}));
    QCOMPARE(viewFor("Map"), view);
}

// Under its own name a popup is found in any case, so this one is given another meanwhile.
void tst_TargetLookup::aLookUpWhileAPopupIsMadeDoesNotHideIt()
{
    PopupRootState root("Popups");
    QVector<const NamedState *> found;
    const ChildWatch watch(&root, [&found](QObject *child) {
        connect(child, &QObject::objectNameChanged, child, [&found] {
            NamedState *const named = NamedState::stateForName("Phone");
            NamedState::removeFromHash("Phone");
            QVERIFY(NamedState::hash("Foreign", named));
            found = {named, popupFor("Phone")};
        });
    });

    auto *popup = new PopupState("Phone", &root, 1);

    QCOMPARE(found, QVector<const NamedState *>({popup, nullptr}));
    QCOMPARE(popupFor("Phone"), popup);
    NamedState::removeFromHash("Foreign");
}

QTEST_GUILESS_MAIN(tst_TargetLookup)
#include "tst_targetlookup.moc"
