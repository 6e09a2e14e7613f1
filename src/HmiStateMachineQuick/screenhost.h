#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>
#include <HmiStateMachineQuick/presenter.h>
#include <HmiStateMachineQuick/scenehost.h>

#include <QList>

#include <qqml.h>

namespace HmiStateMachine {

class HostAttached;

/**
 * Shows the active view of a QuickViewStateTarget, one screen at a time.
 *
 * The components of screens are declared inside as ViewComponent, or found by the source pattern.
 * A screen is an Item, which is made as large as the host; those of the properties "viewId",
 * "viewData" and "activationData" that it declares are kept up to date. While a screen leaves it
 * takes no input. Forwards, screens come in from the right; a back press brings them in from the
 * left.
 *
 * @code{.qml}
 * ScreenHost {
 *     anchors.fill: parent
 *     source: "views/%1.qml"     // the view "Media/Player" is views/Media/Player.qml
 *     keep: 3                    // the three screens left last stay as they were
 * }
 * @endcode
 */
class HMISTATEMACHINEQUICK_EXPORT ScreenHost : public SceneHost, public ViewPresenter
{
    Q_OBJECT
    Q_PROPERTY(int keep READ keep WRITE setKeep NOTIFY keepChanged)
    Q_PROPERTY(QQuickItem *currentItem READ currentItem NOTIFY currentItemChanged)

public:
    /** Made by QML. Its effect is Slide at first. */
    explicit ScreenHost(QQuickItem *parent = nullptr);
    ~ScreenHost() override;

    /** Called by QML for ScreenHost.position; owned by @p object. */
    static HostAttached *qmlAttachedProperties(QObject *object);

    /**
     * How many screens that were left are kept, with all that the user did there; the one that was
     * left longest ago is dropped first. 0, at first, drops every screen; -1 keeps all.
     */
    int keep() const;

    /** Drops at once what is too many. */
    void setKeep(int number);

    /** The screen that is shown or moves in; null before the first one. */
    QQuickItem *currentItem() const;

    void presentView(const QString &viewId, bool back) override;
    bool isBusy() const override;

Q_SIGNALS:
    void keepChanged();
    void currentItemChanged();

protected:
    /** Becomes the view presenter, and presents the view that is active already. */
    void attach(QuickViewStateTarget *target) override;

    /** Withdraws as the view presenter. */
    void detach(QuickViewStateTarget *target) override;

    void clear() override;
    HostedComponent *declaredComponent(const QString &id) const override;

private:
    Q_DISABLE_COPY(ScreenHost)

    HostedItem *makeItem(const QString &viewId);
    QVariantMap dataOf(const QString &viewId) const;
    void updateData();
    void enter(bool back);
    void endEntry();
    void dropLeaving();
    void trimKept();
    void showWarning(const QString &text);
    void busyChanged();

    HostedItem *m_pending = nullptr;
    HostedItem *m_current = nullptr;
    HostedItem *m_leaving = nullptr;
    QList<HostedItem *> m_kept;
    int m_keep = 0;
    QPointer<QQuickItem> m_banner;
};

} // namespace HmiStateMachine

QML_DECLARE_TYPEINFO(HmiStateMachine::ScreenHost, QML_HAS_ATTACHED_PROPERTIES)
