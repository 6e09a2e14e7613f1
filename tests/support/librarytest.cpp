#include "librarytest.h"

#include "driving.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QtTest>

using namespace HmiStateMachine;

void LibraryTest::init()
{
    NamedState::setLoggingEnabled(false);
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    HmiViewState::setLastKnownViewState(QString());
    m_messages.reset(new MessageRecorder);
}

void LibraryTest::cleanup()
{
    settle();
    const QStringList unexpected = m_messages->take();
    m_messages.reset();
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    // They go by the address of the sender, which an object of the next function may have again.
    const auto groups =
        QCoreApplication::instance()->findChildren<ParallelSiblingTransitionGroup *>(
            QString(), Qt::FindDirectChildrenOnly);
    qDeleteAll(groups);

    QCOMPARE(unexpected, QStringList());
    QCOMPARE(NamedState::namedStates().size(), 0);
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition().size(), 0);
    QVERIFY(!HmiViewState::activeViewState());
}
