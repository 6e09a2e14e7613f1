#pragma once

#include <QQmlError>
#include <QQmlIncubator>
#include <QUrl>

#include <functional>
#include <memory>

class QQmlComponent;
class QQmlContext;
class QQmlEngine;
class QQuickItem;

namespace HmiStateMachine {

/** Makes one item of a component, at once or while the scene goes on. */
class ItemMaker : private QQmlIncubator
{
public:
    struct Callbacks
    {
        std::function<void(QQuickItem *)> prepare; ///< before the item's bindings are evaluated
        std::function<void(QQuickItem *)> made; ///< takes the item over
        std::function<void(const QUrl &file, int line, const QString &text)> failed;
    };

    ItemMaker(const Callbacks &callbacks, bool asynchronous);
    ~ItemMaker() override;

    void makeOf(const QUrl &url, QQmlEngine *engine, QQmlContext *context);

    /** @p component is not owned, and has to outlive this. */
    void makeOf(QQmlComponent *component, QQmlContext *context);

    /** Whether neither made() nor failed() has been called. */
    bool isBusy() const;

private:
    void setInitialState(QObject *object) override;
    void statusChanged(Status status) override;
    void goOn();
    void take(QObject *object);
    void fail(const QList<QQmlError> &errors);
    void fail(const QUrl &file, int line, const QString &text);

    Callbacks m_callbacks;
    bool m_asynchronous;
    bool m_busy = false;
    std::unique_ptr<QQmlComponent> m_ownComponent;
    QQmlComponent *m_component = nullptr;
    QQmlContext *m_context = nullptr;
};

} // namespace HmiStateMachine
