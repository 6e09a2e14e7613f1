#include "libraryflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace Library {

namespace {

constexpr int popupKind = 1;

} // namespace

ShapeFlow::ShapeFlow(const FlowShape &shape)
    : m_screenIds(shape.screens()), m_viewParent(&machine())
{
    HmiViewState::setLastKnownViewState(QString()); // what an earlier flow has left behind
    buildLayers(shape.layers);
    buildViews(shape);
    buildPopups(shape);
    start(machine().findChild<QState *>(QString(), Qt::FindDirectChildrenOnly));
    if (shape.popupsShownBefore) {
        showPopupsOnce(shape.popupNames());
    }
}

ShapeFlow::~ShapeFlow()
{
    stop();
    qDeleteAll(machine().findChildren<QState *>(QString(), Qt::FindDirectChildrenOnly));
}

void ShapeFlow::showPopupsOnce(const QStringList &names)
{
    for (const QString &name : names) {
        requestPopup(name, 0);
        dismissPopup(dismissIdentifier(name));
    }
}

void ShapeFlow::requestView(const QString &id, int data)
{
    post(new HmiViewEvent(id, data));
}

void ShapeFlow::requestBack()
{
    post(new HmiBackEvent(1, QString()));
}

void ShapeFlow::requestPopup(const QString &name, int data)
{
    post(new PopupEvent(name, data));
}

QString ShapeFlow::dismissIdentifier(const QString &popup) const
{
    return PopupState::stateForTarget(popup)->dismissEventIdentifier();
}

void ShapeFlow::dismissPopup(const QString &identifier)
{
    post(new PopupEvent(identifier, QVariant()));
}

void ShapeFlow::buildLayers(int count)
{
    for (int i = 0; i < count; ++i) {
        auto *layered = new HmiLayeredState(QStringLiteral("Layer%1").arg(i), m_viewParent);
        if (m_innermost) {
            m_innermost->setInitialHmiState(layered);
        }
        m_innermost = layered;
        m_viewParent = layered;
    }
}

void ShapeFlow::buildViews(const FlowShape &shape)
{
    const QStringList names = shape.viewNames();
    for (int i = 0; i < names.size(); ++i) {
        auto *view = new HmiViewState(m_screenIds.at(i), names.at(i), m_viewParent);
        if (shape.back) {
            view->setHandlesBackEvent(true);
        }
        for (int key = 0; key < shape.keys; ++key) {
            new KeySignalTransition(&m_keys, SIGNAL(keyChanged(int, int)), key, keyPressed, view);
        }
        if (i == 0 && m_innermost) {
            m_innermost->setInitialHmiState(view);
        }
    }
}

void ShapeFlow::buildPopups(const FlowShape &shape)
{
    const QStringList names = shape.popupNames();
    for (const QString &name : names) {
        new PopupState(name, m_innermost, popupKind);
    }
}

} // namespace Library
