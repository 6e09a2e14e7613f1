#include <HmiStateMachineQuick/internal/hosteditem.h>

#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/hostedcomponent.h>
#include <HmiStateMachineQuick/internal/itemmaker.h>
#include <HmiStateMachineQuick/internal/log.h>

#include <QQmlContext>
#include <QQmlEngine>
#include <QVariantAnimation>

#include <utility>

namespace HmiStateMachine {

namespace {

// An id may hold what means something else in a URL; its slashes are folders.
QUrl urlOf(const QString &pattern, const QString &id, QQmlContext *context)
{
    const QString path = QString::fromLatin1(QUrl::toPercentEncoding(id, QByteArrayLiteral("/")));
    return context->resolvedUrl(QUrl(QString(pattern).replace(QStringLiteral("%1"), path)));
}

void assign(QObject *object, const QVariantMap &values)
{
    for (auto it = values.cbegin(); it != values.cend(); ++it) {
        const QByteArray name = it.key().toLatin1();
        if (object->metaObject()->indexOfProperty(name.constData()) >= 0) {
            object->setProperty(name.constData(), it.value());
        }
    }
}

} // namespace

HostedItem::HostedItem(const QString &id, const Manner &manner, SceneHost *host)
    : QObject(host), m_id(id), m_manner(manner), m_host(host),
      m_animation(new QVariantAnimation(this))
{
    connect(m_animation, &QVariantAnimation::valueChanged, this,
            [this](const QVariant &value) { setPosition(value.toReal()); });
    connect(m_animation, &QAbstractAnimation::finished, this, &HostedItem::endMove);
}

HostedItem::~HostedItem() = default;

void HostedItem::load(const QVariantMap &properties, const std::function<void()> &ready)
{
    const ItemMaker::Callbacks callbacks{
        [this, properties](QQuickItem *item) { prepare(item, properties); },
        [this, ready](QQuickItem *item) { take(item, ready); },
        [this, ready](const QUrl &file, int line, const QString &text) {
            standIn({m_id, file, line, text}, ready);
        }};
    m_maker = std::make_unique<ItemMaker>(callbacks, m_host->asynchronous());
    QQmlContext *context = qmlContext(m_host);
    const HostedComponent *declared = m_host->declaredComponent(m_id);
    if (declared && declared->delegate()) {
        m_maker->makeOf(declared->delegate(), context);
    } else if (declared && !declared->source().isEmpty()) {
        m_maker->makeOf(context->resolvedUrl(declared->source()), qmlEngine(m_host), context);
    } else if (!m_host->source().isEmpty()) {
        m_maker->makeOf(urlOf(m_host->source(), m_id, context), qmlEngine(m_host), context);
    } else {
        standIn({m_id, QUrl(), -1, QStringLiteral("there is no component for it")}, ready);
    }
}

void HostedItem::discard()
{
    m_discarded = true;
    jumpTo(m_position);
    deleteLater();
}

QString HostedItem::id() const
{
    return m_id;
}

QQuickItem *HostedItem::item() const
{
    return m_item;
}

bool HostedItem::hasFailed() const
{
    return m_failed;
}

bool HostedItem::isBusy() const
{
    return !m_item || m_animation->state() == QAbstractAnimation::Running;
}

void HostedItem::setProperties(const QVariantMap &values)
{
    if (m_item && !m_failed) {
        assign(m_item, values);
    }
}

void HostedItem::moveTo(qreal to, const std::function<void()> &done)
{
    m_animation->stop();
    m_done = done;
    m_goal = to;
    if (m_host->duration() <= 0) {
        setPosition(to);
        endMove();
        return;
    }
    m_animation->setStartValue(m_position);
    m_animation->setEndValue(to);
    m_animation->setDuration(m_host->duration());
    m_animation->setEasingCurve(m_host->easing());
    m_animation->start();
}

void HostedItem::jumpTo(qreal position)
{
    m_done = nullptr;
    m_animation->stop();
    m_goal = position;
    setPosition(position);
}

qreal HostedItem::position() const
{
    return m_position;
}

qreal HostedItem::goal() const
{
    return m_goal;
}

void HostedItem::fit()
{
    if (m_item) {
        m_item->setSize(m_host->size());
        setPosition(m_position);
    }
}

void HostedItem::prepare(QQuickItem *item, const QVariantMap &properties)
{
    assign(item, properties);
    item->setParentItem(m_host);
    item->setSize(m_host->size());
}

void HostedItem::take(QQuickItem *item, const std::function<void()> &ready)
{
    m_item = item;
    QQmlEngine::setObjectOwnership(item, QQmlEngine::CppOwnership);
    item->setParent(this);
    if (!m_discarded) {
        ready();
    }
}

void HostedItem::standIn(const LoadError &error, const std::function<void()> &ready)
{
    if (m_discarded) {
        return;
    }
    m_failed = true;
    m_host->target()->reportLoadError(error);
    QQmlComponent builtIn(qmlEngine(m_host),
                          QUrl(QStringLiteral("qrc:/HmiStateMachineQuick/ErrorCard.qml")));
    QQmlComponent *component = m_host->errorComponent() ? m_host->errorComponent() : &builtIn;
    QQmlContext *declared = component->creationContext();
    QObject *object = component->beginCreate(declared ? declared : qmlContext(m_host));
    auto *item = qobject_cast<QQuickItem *>(object);
    if (!item) {
        qCWarning(hmistatemachinequick, "no error item: %s",
                  qUtf8Printable(component->errorString()));
        item = new QQuickItem;
    }
    prepare(item,
            {{QStringLiteral("failedId"), error.id},
             {QStringLiteral("file"), error.file},
             {QStringLiteral("line"), error.line},
             {QStringLiteral("text"), error.text}});
    component->completeCreate();
    if (object != item) {
        delete object;
    }
    take(item, ready);
}

void HostedItem::setPosition(qreal position)
{
    m_position = position;
    if (m_item) {
        m_manner.attached(m_item)->setPosition(position);
        m_manner.move(m_item, position);
    }
}

// What is done may well end this item.
void HostedItem::endMove()
{
    if (const auto done = std::exchange(m_done, nullptr)) {
        done();
    }
}

} // namespace HmiStateMachine
