#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>

#include <QEasingCurve>
#include <QPointer>
#include <QQmlComponent>
#include <QQuickItem>
#include <QUrl>

namespace HmiStateMachine {

class HostedComponent;
class HostedItem;
class QuickViewStateTarget;
struct LoadError;

/**
 * What ScreenHost and PopupHost share: where components come from, and how items move.
 *
 * A host looks first for a component declared inside it and then at its source pattern. What cannot
 * be loaded is reported to the target, and an error item stands in its place.
 */
class HMISTATEMACHINEQUICK_EXPORT SceneHost : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(HmiStateMachine::QuickViewStateTarget *target READ target WRITE setTarget NOTIFY
                   targetChanged)
    Q_PROPERTY(QString source MEMBER m_source NOTIFY sourceChanged)
    Q_PROPERTY(bool asynchronous MEMBER m_asynchronous NOTIFY asynchronousChanged)
    Q_PROPERTY(int duration MEMBER m_duration NOTIFY durationChanged)
    Q_PROPERTY(QEasingCurve easing MEMBER m_easing NOTIFY easingChanged)
    Q_PROPERTY(Effect effect MEMBER m_effect NOTIFY effectChanged)
    Q_PROPERTY(QQmlComponent *errorComponent MEMBER m_errorComponent NOTIFY errorComponentChanged)

public:
    /** How items move in and out. */
    enum Effect {
        NoEffect, ///< not by the host: items bind to the attached position
        Fade, ///< by opacity; a popup grows a little besides
        Slide ///< a screen from the side, a popup from above
    };
    Q_ENUM(Effect)

    ~SceneHost() override;

    /** The published target unless another one is set. Not owned. */
    QuickViewStateTarget *target() const;

    /** Null shows nothing. What was shown for the former target goes. */
    void setTarget(QuickViewStateTarget *target);

    /**
     * The URL of a component with "%1" in place of the id, relative to the file of the host:
     * "views/%1.qml". Empty when all components are declared.
     */
    QString source() const;

    /** Loads components while the scene goes on; off at first. */
    bool asynchronous() const;

    /** In milliseconds; 250 unless set, 0 for none. */
    int duration() const;

    /** OutCubic unless set. */
    QEasingCurve easing() const;

    /** Slide for screens and Fade for popups unless set. */
    Effect effect() const;

    /**
     * Makes the item that stands in the place of one that cannot be loaded; it may have the
     * properties "failedId", "file", "line" and "text". A plain card unless set. Not owned.
     */
    QQmlComponent *errorComponent() const;

Q_SIGNALS:
    void targetChanged();
    void sourceChanged();
    void asynchronousChanged();
    void durationChanged();
    void easingChanged();
    void effectChanged();
    void errorComponentChanged();

protected:
    /** For ScreenHost and PopupHost, with the effect that they have at first. */
    SceneHost(Effect effect, QQuickItem *parent);

    /** Takes the published target when none is set, and begins to show it. */
    void componentComplete() override;

    /** Gives all items the new size. */
    void geometryChanged(const QRectF &newGeometry, const QRectF &oldGeometry) override;

    /** Begins to show what @p target says. */
    virtual void attach(QuickViewStateTarget *target) = 0;

    /** Does not show any more what @p target says. */
    virtual void detach(QuickViewStateTarget *target) = 0;

    /** Lets go of all items, because the target to which they belong is not shown any more. */
    virtual void clear() = 0;

    /** The component that is declared for @p id; null when there is none. */
    virtual HostedComponent *declaredComponent(const QString &id) const = 0;

private:
    Q_DISABLE_COPY(SceneHost)

    friend class HostedItem;

    void followTarget(QuickViewStateTarget *target);

    QPointer<QuickViewStateTarget> m_target;
    QString m_source;
    bool m_asynchronous = false;
    int m_duration;
    QEasingCurve m_easing;
    Effect m_effect;
    QQmlComponent *m_errorComponent = nullptr;
};

} // namespace HmiStateMachine
