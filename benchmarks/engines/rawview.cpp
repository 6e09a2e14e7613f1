#include "rawview.h"

#include "rawevents.h"

#include <HmiStateMachine/named/viewstatetarget.h>

namespace Raw {

namespace {

bool isBack(const QEvent *event)
{
    return event->type() == BackEventType && static_cast<const BackEvent *>(event)->depth > 0;
}

} // namespace

View *Screens::find(const QString &viewId) const
{
    View *view = byName.value(viewId);
    return view ? view : byScreen.value(viewId);
}

ViewTransition::ViewTransition(Screens &screens, QState *source)
    : QAbstractTransition(source), m_screens(screens)
{
}

bool ViewTransition::eventTest(QEvent *event)
{
    if (event->type() != ViewEventType) {
        return false;
    }
    setTargetState(m_screens.find(static_cast<ViewEvent *>(event)->viewId));
    return targetState() != sourceState();
}

void ViewTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

BackTransition::BackTransition(QState *source) : QAbstractTransition(source)
{
}

bool BackTransition::eventTest(QEvent *event)
{
    return event->type() == BackEventType;
}

void BackTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

View::View(Screens &screens, const QString &name, const QString &screen, QState *parent)
    : QState(parent), m_screens(screens), m_name(name), m_screen(screen)
{
    setObjectName(name);
    m_screens.byName.insert(name, this);
    if (screen != name) {
        m_screens.byScreen.insert(screen, this);
    }
    new ViewTransition(screens, this);
}

View::~View()
{
    m_screens.byName.remove(m_name);
    m_screens.byScreen.remove(m_screen);
}

void View::handleBack()
{
    m_back = new BackTransition(this);
}

void View::addInstanceData(const QString &key, const QVariant &value)
{
    m_instanceData.insert(key, value);
}

void View::onEntry(QEvent *event)
{
    m_screens.layer.resetScreenPopupBehavior();
    const bool backEntry = isBack(event);
    if (m_back) {
        findBackTarget(event, backEntry);
    }
    m_screens.active = this;
    m_instanceData.insert(QStringLiteral("eventData"),
                          event->type() == ViewEventType ? static_cast<ViewEvent *>(event)->data
                                                         : QVariant());
    m_instanceData.insert(QStringLiteral("entryReason"), backEntry ? 1 : 0);
    m_screens.layer.activateView(m_screen, m_instanceData);
    Q_EMIT m_screens.layer.activeViewDataChanged(QVariant());
}

void View::onExit(QEvent *event)
{
    const bool backExit = isBack(event);
    if (!backExit) {
        const QString target = backTargetName();
        if (!target.isEmpty()) {
            m_backStack.push(target);
        }
        m_screens.lastKnown = m_name;
    }
    m_instanceData.insert(QStringLiteral("exitReason"), backExit ? 1 : 0);
    m_screens.layer.deactivateView(m_screen, m_instanceData);
    m_screens.active = nullptr;
}

void View::findBackTarget(const QEvent *event, bool backEntry)
{
    if (backEntry) {
        const auto *back = static_cast<const BackEvent *>(event);
        m_back->setTargetState(m_backStack.isEmpty() ? nullptr
                                                     : m_screens.byName.value(m_backStack.pop()));
        m_screens.layer.postFollowOnBackEvent(back->depth, back->targetId, m_screen);
    } else if (!m_screens.lastKnown.isEmpty() && m_screens.lastKnown != m_name) {
        m_back->setTargetState(m_screens.byName.value(m_screens.lastKnown));
    }
}

QString View::backTargetName() const
{
    const auto *target = m_back ? static_cast<View *>(m_back->targetState()) : nullptr;
    return target ? target->m_name : QString();
}

} // namespace Raw
