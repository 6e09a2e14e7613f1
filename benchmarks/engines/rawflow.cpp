#include "rawflow.h"

#include "rawevents.h"
#include "rawkey.h"

namespace Raw {

namespace {

constexpr int popupKind = 1;

} // namespace

ShapeFlow::ShapeFlow(const FlowShape &shape)
    : m_screens(layer()), m_screenIds(shape.screens()), m_viewParent(&machine())
{
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
    // Before the screens that its views tell of their end.
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
    post(new ViewEvent(id, data));
}

void ShapeFlow::requestBack()
{
    post(new BackEvent(1, QString()));
}

void ShapeFlow::requestPopup(const QString &name, int data)
{
    post(new PopupEvent(name, false, data));
}

QString ShapeFlow::dismissIdentifier(const QString &popup) const
{
    return m_popups->find(popup)->dismissName();
}

void ShapeFlow::dismissPopup(const QString &identifier)
{
    post(new PopupEvent(identifier, false, QVariant()));
}

// The same regions as a layered state has: the views with a region of their own, the popups beside.
void ShapeFlow::buildLayers(int count)
{
    for (int i = 0; i < count; ++i) {
        auto *layered = new QState(QState::ParallelStates, m_viewParent);
        if (m_viewParent != &machine()) {
            m_viewParent->setInitialState(layered);
        }
        auto *region = new QState(layered);
        auto *exclusive = new QState(region);
        region->setInitialState(exclusive);
        m_popups = new PopupLayer(layer(), layered);
        for (QState *screen : {layered, region, exclusive}) {
            QObject::connect(screen, &QState::entered, &layer(),
                             &HmiStateMachine::ViewStateTarget::resetScreenPopupBehavior);
        }
        m_viewParent = exclusive;
    }
}

void ShapeFlow::buildViews(const FlowShape &shape)
{
    const QStringList names = shape.viewNames();
    for (int i = 0; i < names.size(); ++i) {
        auto *view = new View(m_screens, names.at(i), m_screenIds.at(i), m_viewParent);
        if (shape.back) {
            view->handleBack();
        }
        for (int key = 0; key < shape.keys; ++key) {
            new KeyTransition(&m_keys, SIGNAL(keyChanged(int, int)), key, keyPressed, view);
        }
        if (i == 0 && m_viewParent != &machine()) {
            m_viewParent->setInitialState(view);
        }
    }
}

void ShapeFlow::buildPopups(const FlowShape &shape)
{
    const QStringList names = shape.popupNames();
    for (const QString &name : names) {
        new Popup(name, popupKind, m_popups);
    }
}

} // namespace Raw
