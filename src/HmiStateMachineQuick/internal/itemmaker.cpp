#include <HmiStateMachineQuick/internal/itemmaker.h>

#include <QQmlComponent>
#include <QQmlContext>
#include <QQuickItem>

namespace HmiStateMachine {

ItemMaker::ItemMaker(const Callbacks &callbacks, bool asynchronous)
    : QQmlIncubator(asynchronous ? Asynchronous : Synchronous), m_callbacks(callbacks),
      m_asynchronous(asynchronous)
{
}

ItemMaker::~ItemMaker()
{
    clear(); // an item that is half made goes too
}

void ItemMaker::makeOf(const QUrl &url, QQmlEngine *engine, QQmlContext *context)
{
    const auto mode =
        m_asynchronous ? QQmlComponent::Asynchronous : QQmlComponent::PreferSynchronous;
    m_ownComponent = std::make_unique<QQmlComponent>(engine, url, mode);
    makeOf(m_ownComponent.get(), context);
}

void ItemMaker::makeOf(QQmlComponent *component, QQmlContext *context)
{
    m_busy = true;
    m_component = component;
    // What is declared inside a file sees the names of that file.
    QQmlContext *declared = component->creationContext();
    m_context = declared ? declared : context;
    if (component->isLoading()) {
        QObject::connect(component, &QQmlComponent::statusChanged, component, [this] { goOn(); });
    } else {
        goOn();
    }
}

bool ItemMaker::isBusy() const
{
    return m_busy;
}

void ItemMaker::setInitialState(QObject *object)
{
    if (auto *item = qobject_cast<QQuickItem *>(object)) {
        m_callbacks.prepare(item);
    }
}

void ItemMaker::statusChanged(Status status)
{
    if (status == Ready) {
        take(object());
    } else if (status == Error) {
        fail(errors());
    }
}

void ItemMaker::goOn()
{
    if (m_component->isError()) {
        fail(m_component->errors());
    } else if (m_component->isReady()) {
        m_component->create(*this, m_context);
    }
}

void ItemMaker::take(QObject *object)
{
    if (auto *item = qobject_cast<QQuickItem *>(object)) {
        m_busy = false;
        m_callbacks.made(item);
        return;
    }
    delete object;
    fail(m_component->url(), 1, QStringLiteral("the root is no Item"));
}

// An error in a file that the component uses stands behind those about the places that use it.
void ItemMaker::fail(const QList<QQmlError> &errors)
{
    if (errors.isEmpty()) {
        fail(m_component->url(), -1, QStringLiteral("unknown error"));
        return;
    }
    const QQmlError &first = errors.first();
    const QQmlError &last = errors.last();
    const QQmlError &cause = last.url() == first.url() ? first : last;
    fail(cause.url(), cause.line(), cause.description());
}

void ItemMaker::fail(const QUrl &file, int line, const QString &text)
{
    m_busy = false;
    m_callbacks.failed(file, line, text);
}

} // namespace HmiStateMachine
