#include <HmiStateMachineQuick/popuphost.h>

#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/internal/hosteditem.h>
#include <HmiStateMachineQuick/popupcomponent.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <algorithm>

namespace HmiStateMachine {

namespace {

constexpr qreal smallest = 0.92; // the scale from which a popup grows while it fades in

void movePopup(SceneHost::Effect effect, QQuickItem *item, qreal position)
{
    switch (effect) {
    case SceneHost::Fade:
        item->setOpacity(1 - position);
        item->setScale(1 - position * (1 - smallest));
        break;
    case SceneHost::Slide:
        item->setY(-position * item->height());
        break;
    case SceneHost::NoEffect:
        break;
    }
}

} // namespace

PopupHost::PopupHost(QQuickItem *parent) : SceneHost(Fade, parent)
{
}

PopupHost::~PopupHost()
{
    if (target()) {
        PopupHost::detach(target()); // its own: what derives from it is gone
    }
}

HostAttached *PopupHost::qmlAttachedProperties(QObject *object)
{
    return new HostAttached(object);
}

QStringList PopupHost::suppressedLayers() const
{
    return m_suppressedLayers;
}

void PopupHost::setSuppressedLayers(const QStringList &layers)
{
    if (layers == m_suppressedLayers) {
        return;
    }
    m_suppressedLayers = layers;
    if (target()) { // there is none yet while the scene is being made
        updateOrder();
    }
    Q_EMIT suppressedLayersChanged();
}

QQuickItem *PopupHost::topItem() const
{
    return m_top;
}

// A popup that is shown again, perhaps on its way out, is taken as it is.
void PopupHost::presentPopup(const QString &popupId)
{
    if (!target()) {
        return; // nobody asks but a target
    }
    HostedItem *popup = m_popups.value(popupId);
    if (!popup && m_leaving.contains(popupId)) {
        popup = m_leaving.take(popupId);
        popup->jumpTo(popup->position()); // the way out ends here, and so does what came at its end
        m_popups.insert(popupId, popup);
        target()->reportPopupHidden(popupId);
    }
    if (popup) {
        popup->setProperties(dataOf(popupId));
        if (popup->item()) {
            appear(popup);
        }
        return;
    }
    popup = makeItem(popupId);
    m_popups.insert(popupId, popup);
    popup->load(dataOf(popupId), [this, popup] {
        popup->jumpTo(1);
        appear(popup);
    });
    busyChanged();
}

void PopupHost::withdrawPopup(const QString &popupId)
{
    HostedItem *popup = m_popups.take(popupId);
    if (!popup) {
        return;
    }
    if (!popup->item()) {
        popup->discard(); // was never shown
        busyChanged();
        return;
    }
    m_leaving.insert(popupId, popup);
    popup->item()->setEnabled(false);
    updateOrder();
    target()->reportPopupAnimationStarted(popupId, QuickViewStateTarget::DisappearAnimation);
    popup->moveTo(1, [this, popup] { remove(popup); });
    busyChanged();
}

bool PopupHost::isBusy() const
{
    const auto busy = [](const HostedItem *popup) { return popup->isBusy(); };
    return !m_leaving.isEmpty() || std::any_of(m_popups.cbegin(), m_popups.cend(), busy);
}

void PopupHost::attach(QuickViewStateTarget *target)
{
    const PopupListModel *popups = target->shownPopups();
    connect(popups, &QAbstractItemModel::dataChanged, this,
            [this](const QModelIndex &first, const QModelIndex &last) {
                updateRows(first.row(), last.row());
            });
    target->setPopupPresenter(this);
    for (int row = 0; row < popups->count(); ++row) {
        presentPopup(popups->entry(row).popupId);
    }
}

void PopupHost::detach(QuickViewStateTarget *target)
{
    target->shownPopups()->disconnect(this);
    if (target->popupPresenter() == this) {
        target->setPopupPresenter(nullptr);
    }
}

void PopupHost::clear()
{
    QList<HostedItem *> popups = m_popups.values();
    popups.append(m_leaving.values());
    for (HostedItem *popup : qAsConst(popups)) {
        popup->discard();
    }
    m_popups.clear();
    m_leaving.clear();
    if (m_top) {
        m_top = nullptr;
        Q_EMIT topItemChanged();
    }
}

HostedComponent *PopupHost::declaredComponent(const QString &id) const
{
    const int kind = target()->shownPopups()->entry(rowOf(id)).kind;
    PopupComponent *ofKind = nullptr;
    const auto declared = findChildren<PopupComponent *>(QString(), Qt::FindDirectChildrenOnly);
    for (PopupComponent *component : declared) {
        if (component->popupId() == id) {
            return component;
        }
        if (!ofKind && component->popupId().isEmpty() && component->kind() == kind) {
            ofKind = component;
        }
    }
    return ofKind;
}

HostedItem *PopupHost::makeItem(const QString &popupId)
{
    const HostedItem::Manner manner{
        [](QQuickItem *item) {
            return qobject_cast<HostAttached *>(qmlAttachedPropertiesObject<PopupHost>(item));
        },
        [this](QQuickItem *item, qreal position) { movePopup(effect(), item, position); }};
    return new HostedItem(popupId, manner, this);
}

QVariantMap PopupHost::dataOf(const QString &popupId) const
{
    const PopupEntry entry = target()->shownPopups()->entry(rowOf(popupId));
    return {{QStringLiteral("popupId"), entry.popupId},
            {QStringLiteral("popupKind"), entry.kind},
            {QStringLiteral("popupData"), entry.data},
            {QStringLiteral("remainingTime"), entry.remainingTime},
            {QStringLiteral("totalTime"), entry.totalTime}};
}

int PopupHost::rowOf(const QString &popupId) const
{
    return target()->shownPopups()->indexOf(popupId);
}

void PopupHost::appear(HostedItem *popup)
{
    const bool covered = target()->shownPopups()->entry(rowOf(popup->id())).covered;
    updateOrder();
    if (popup->position() > 0 && !covered) {
        target()->reportPopupAnimationStarted(popup->id(), QuickViewStateTarget::AppearAnimation);
        popup->moveTo(0, [this] { busyChanged(); });
    }
    busyChanged();
    target()->reportPopupShown(popup->id());
}

void PopupHost::remove(HostedItem *popup)
{
    m_leaving.remove(popup->id());
    popup->discard();
    updateOrder();
    busyChanged();
    target()->reportPopupHidden(popup->id());
}

void PopupHost::updateRows(int first, int last)
{
    const PopupListModel *popups = target()->shownPopups();
    for (int row = first; row <= last; ++row) {
        const PopupEntry entry = popups->entry(row);
        HostedItem *popup = m_popups.value(entry.popupId);
        if (!popup) {
            continue;
        }
        popup->setProperties(dataOf(entry.popupId));
        const qreal place = entry.covered ? 1 : 0;
        if (popup->item() && !qFuzzyCompare(1 + popup->goal(), 1 + place)) {
            popup->moveTo(place, [this] {
                updateOrder();
                busyChanged();
            });
        }
    }
    updateOrder();
    busyChanged();
}

// Those on their way out stay where they were, beneath those that come.
void PopupHost::updateOrder()
{
    const PopupListModel *popups = target()->shownPopups();
    for (int row = 0; row < popups->count(); ++row) {
        const PopupEntry entry = popups->entry(row);
        HostedItem *popup = m_popups.value(entry.popupId);
        if (!popup || !popup->item()) {
            continue;
        }
        const bool gone = entry.covered && popup->position() >= 1;
        popup->item()->setZ(row + 1);
        popup->item()->setEnabled(!entry.covered);
        popup->item()->setVisible(!gone && !m_suppressedLayers.contains(entry.layer));
    }
    updateTop();
}

void PopupHost::updateTop()
{
    QQuickItem *top = nullptr;
    const PopupListModel *popups = target()->shownPopups();
    for (int row = 0; row < popups->count(); ++row) {
        const PopupEntry entry = popups->entry(row);
        const HostedItem *popup = m_popups.value(entry.popupId);
        if (popup && popup->item() && !entry.covered && !m_suppressedLayers.contains(entry.layer)) {
            top = popup->item();
        }
    }
    if (top != m_top) {
        m_top = top;
        Q_EMIT topItemChanged();
    }
}

void PopupHost::busyChanged()
{
    target()->reportBusyChanged();
}

} // namespace HmiStateMachine
