#include <HmiStateMachineQuick/scenehost.h>

#include <HmiStateMachineQuick/internal/hosteditem.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>

namespace HmiStateMachine {

namespace {

constexpr int defaultDurationMs = 250;

} // namespace

SceneHost::SceneHost(Effect effect, QQuickItem *parent)
    : QQuickItem(parent), m_duration(defaultDurationMs), m_easing(QEasingCurve::OutCubic),
      m_effect(effect)
{
}

SceneHost::~SceneHost() = default;

QuickViewStateTarget *SceneHost::target() const
{
    return m_target;
}

void SceneHost::setTarget(QuickViewStateTarget *target)
{
    if (target == m_target) {
        return;
    }
    if (isComponentComplete()) {
        followTarget(target);
    } else {
        m_target = target;
    }
    Q_EMIT targetChanged();
}

QString SceneHost::source() const
{
    return m_source;
}

bool SceneHost::asynchronous() const
{
    return m_asynchronous;
}

int SceneHost::duration() const
{
    return m_duration;
}

QEasingCurve SceneHost::easing() const
{
    return m_easing;
}

SceneHost::Effect SceneHost::effect() const
{
    return m_effect;
}

QQmlComponent *SceneHost::errorComponent() const
{
    return m_errorComponent;
}

void SceneHost::componentComplete()
{
    QQuickItem::componentComplete();
    QuickViewStateTarget *target = m_target ? m_target.data() : QuickViewStateTarget::published();
    const bool found = target != m_target;
    m_target = nullptr;
    followTarget(target);
    if (found) {
        Q_EMIT targetChanged();
    }
}

void SceneHost::geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry)
{
    QQuickItem::geometryChanged(newGeometry, oldGeometry);
    const auto items = findChildren<HostedItem *>(QString(), Qt::FindDirectChildrenOnly);
    for (HostedItem *item : items) {
        item->fit();
    }
}

void SceneHost::followTarget(QuickViewStateTarget *target)
{
    if (m_target) {
        m_target->disconnect(this);
        detach(m_target);
        clear();
    }
    m_target = target;
    if (target) {
        connect(target, &QObject::destroyed, this, [this] {
            clear();
            Q_EMIT targetChanged();
        });
        attach(target);
    }
}

} // namespace HmiStateMachine
