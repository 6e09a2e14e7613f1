#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>

#include <QObject>
#include <QVariant>
#include <QVariantMap>

namespace HmiStateMachine {

/**
 * What a user of the scene asks the flow for, by name: the singleton Requests of the module
 * "HmiStateMachine 1.0". It posts to StateMachine::instance(), which answers in its own time.
 *
 * While checksIds is on, a name that nothing has is a warning in the log and a banner in the
 * ScreenHost; the request goes to the flow all the same, which decides. Owned by its
 * QuickViewStateTarget.
 *
 * @code{.qml}
 * TapHandler { onTapped: Requests.view("Media/Player", { track: 7 }) }
 * @endcode
 */
class HMISTATEMACHINEQUICK_EXPORT Requests : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool checksIds READ checksIds WRITE setChecksIds NOTIFY checksIdsChanged)
    Q_PROPERTY(QVariantMap keys READ keys WRITE setKeys NOTIFY keysChanged)

public:
    /** Made by the QuickViewStateTarget. */
    explicit Requests(QObject *parent = nullptr);
    ~Requests() override;

    /** On in debug builds of this component, off in others. */
    bool checksIds() const;

    /** Counts from the next request on. */
    void setChecksIds(bool on);

    /** The application's key codes by name; empty at first. */
    QVariantMap keys() const;

    /** Replaces all codes: names to integers. */
    void setKeys(const QVariantMap &codes);

    /** A view, by the name of its state or by its view id, or any other state that shows one. */
    Q_INVOKABLE void view(const QString &id, const QVariant &data = QVariant());

    /**
     * @p depth back steps, 0 to 255, and then on until @p target is reached when there is one.
     * Another depth is a warning, and nothing happens.
     */
    Q_INVOKABLE void back(int depth = 1, const QString &target = QString());

    /** A popup, by the name of its state or by its popup view id. */
    Q_INVOKABLE void popup(const QString &id, const QVariant &data = QVariant());

    /** Dismisses a popup, named in the same way. A popup that cannot be dismissed is a warning. */
    Q_INVOKABLE void dismiss(const QString &id);

    /** Dismisses whichever popup is in front, in each layer. */
    Q_INVOKABLE void dismissAny();

    /** QObject's own stays in sight beside the request of that name. */
    using QObject::event;

    /** An HmiEvent, whose names only the transitions know. */
    Q_INVOKABLE void event(const QString &name, const QVariant &data = QVariant());

    /**
     * Emits keyChanged() with the code of that key. A name that is not among keys is a warning
     * while checksIds is on, and nothing is emitted.
     */
    Q_INVOKABLE void key(const QString &name, int status);

Q_SIGNALS:
    void checksIdsChanged();
    void keysChanged();

    /** What key transitions watch; see KeySignalTransition. */
    void keyChanged(int key, int status);

    /** A request has been made. @p kind is the name of the operation, @p id its first text. */
    void requested(const QString &kind, const QString &id, const QVariant &data);

    /** Something was asked for that does not exist. */
    void warned(const QString &text);

private:
    Q_DISABLE_COPY(Requests)

    void warn(const QString &text);
    void warnUnless(bool known, const QString &what, const QString &id);

    bool m_checksIds;
    QVariantMap m_keys;
};

} // namespace HmiStateMachine
