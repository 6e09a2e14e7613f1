#pragma once

#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <HmiStateMachineQuick/scenehost.h>

#include <QObject>
#include <QPointer>
#include <QVariantMap>

#include <functional>
#include <memory>

class QVariantAnimation;

namespace HmiStateMachine {

class HostAttached;
class ItemMaker;

/**
 * An item that a host shows, from the loading of its component to the end of its way out. A host
 * gets rid of it by discard().
 */
class HostedItem : public QObject
{
    Q_OBJECT

public:
    /** What the hosts do differently. */
    struct Manner
    {
        std::function<HostAttached *(QQuickItem *)> attached;
        std::function<void(QQuickItem *, qreal position)> move; ///< by the host's effect
    };

    HostedItem(const QString &id, const Manner &manner, SceneHost *host);

    /** The item goes with it. */
    ~HostedItem() override;

    /**
     * Makes the item, and calls @p ready when it is there, which may be at once. What cannot be
     * loaded is reported, and an error item made instead.
     */
    void load(const QVariantMap &properties, const std::function<void()> &ready);

    /** Calls nobody any more, and is deleted later: the item may be handling an event. */
    void discard();

    QString id() const;

    /** Null until it is ready. */
    QQuickItem *item() const;

    /** Whether the item stands in for one that could not be loaded. */
    bool hasFailed() const;

    /** Whether it is being loaded or moves. */
    bool isBusy() const;

    /** Gives the item those of the values for which it has a property. */
    void setProperties(const QVariantMap &values);

    /** Moves to @p to within the host's duration, and calls @p done at the end. */
    void moveTo(qreal to, const std::function<void()> &done);

    /** Is there at once; what was to be done at the end of a move is not. */
    void jumpTo(qreal position);

    qreal position() const;

    /** Where the move leads, or where it is when it does not move. */
    qreal goal() const;

    /** Makes the item as large as the host. */
    void fit();

private:
    Q_DISABLE_COPY(HostedItem)

    void prepare(QQuickItem *item, const QVariantMap &properties);
    void take(QQuickItem *item, const std::function<void()> &ready);
    void standIn(const LoadError &error, const std::function<void()> &ready);
    void setPosition(qreal position);
    void endMove();

    QString m_id;
    Manner m_manner;
    SceneHost *m_host;
    std::unique_ptr<ItemMaker> m_maker;
    QPointer<QQuickItem> m_item;
    QVariantAnimation *m_animation;
    std::function<void()> m_done;
    qreal m_position = 0;
    qreal m_goal = 0;
    bool m_failed = false;
    bool m_discarded = false;
};

} // namespace HmiStateMachine
