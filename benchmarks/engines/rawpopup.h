#pragma once

#include <QAbstractTransition>
#include <QHash>
#include <QMap>
#include <QState>
#include <QStringList>
#include <QVariant>

namespace HmiStateMachine {
class ViewStateTarget;
}

namespace Raw {

class Popup;

/**
 * A layer of popups, as one writes it on bare states: one child is active, the quiet state or one
 * popup. A popup that is interrupted comes back.
 */
class PopupLayer : public QState
{
    Q_OBJECT

public:
    PopupLayer(HmiStateMachine::ViewStateTarget &layer, QState *parent);

    QState *quiet() const { return m_quiet; }
    HmiStateMachine::ViewStateTarget &layer() const { return m_layer; }
    Popup *find(const QString &name) const { return m_byName.value(name); }
    Popup *front() const { return m_front; }

    void add(const QString &name, Popup *popup) { m_byName.insert(name, popup); }
    void enter(Popup *popup);
    void leave() { m_front = nullptr; }

    /** Keeps the popup named @p name from coming back. */
    void giveUp(const QString &name) { m_returns.removeAll(name); }
    bool willReturn(const QString &name) const { return m_returns.contains(name); }
    bool isProhibited(const QString &front, const QString &requested) const;

Q_SIGNALS:
    /** Emit it to throw the popup in front away. */
    void reset();

private:
    void requestReturn();
    void followDomain(int newDomain, int oldDomain);
    void followView(const QString &newView, const QString &oldView);

    HmiStateMachine::ViewStateTarget &m_layer;
    QState *m_quiet;
    Popup *m_front = nullptr;
    QHash<QString, Popup *> m_byName;
    QHash<QPair<QString, QString>, bool> m_prohibited;
    QStringList m_returns;
};

/** Leads to whichever popup an event asks for. */
class PopupTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    explicit PopupTransition(PopupLayer *source);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    PopupLayer *m_popups;
};

/** Gives up a popup that waits to come back; leads nowhere. */
class WaitingDismissTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    explicit WaitingDismissTransition(PopupLayer *source);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    PopupLayer *m_popups;
};

/** Leads away from the popup in front when an event dismisses it. */
class DismissTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    explicit DismissTransition(Popup *source, PopupLayer *popups);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    Popup *m_popup;
};

/** One popup: it tells the view layer of entry and exit. */
class Popup : public QState
{
    Q_OBJECT

public:
    Popup(const QString &name, int kind, PopupLayer *popups);

    const QString &name() const { return m_name; }
    const QString &dismissName() const { return m_dismissName; }

    void show();
    void hide();

    /** Hides it for good. */
    void giveUp();

protected:
    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

private:
    PopupLayer *m_popups;
    QString m_name;
    QString m_dismissName;
    int m_kind;
    QMap<QString, QVariant> m_instanceData;
};

} // namespace Raw
