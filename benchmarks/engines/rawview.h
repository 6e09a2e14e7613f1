#pragma once

#include <QAbstractTransition>
#include <QHash>
#include <QMap>
#include <QStack>
#include <QState>
#include <QVariant>

namespace HmiStateMachine {
class ViewStateTarget;
}

namespace Raw {

class View;

/** What the views of one flow share. */
struct Screens
{
    explicit Screens(HmiStateMachine::ViewStateTarget &viewLayer) : layer(viewLayer) { }

    View *find(const QString &viewId) const;

    HmiStateMachine::ViewStateTarget &layer;
    QHash<QString, View *> byName;
    QHash<QString, View *> byScreen;
    QString lastKnown;
    View *active = nullptr;
};

/** Leads from its source to whichever view an event asks for. */
class ViewTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    ViewTransition(Screens &screens, QState *source);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    Screens &m_screens;
};

/** Leads to the view that a back press goes to. */
class BackTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    explicit BackTransition(QState *source);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;
};

/** One screen, as one writes it on a bare QState: it tells the view layer of entry and exit. */
class View : public QState
{
    Q_OBJECT

public:
    View(Screens &screens, const QString &name, const QString &screen, QState *parent);
    ~View() override;

    /** Lets a back press lead to where the view was entered from. */
    void handleBack();

    void addInstanceData(const QString &key, const QVariant &value);

protected:
    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

private:
    void findBackTarget(const QEvent *event, bool backEntry);
    QString backTargetName() const;

    Screens &m_screens;
    QString m_name;
    QString m_screen;
    QMap<QString, QVariant> m_instanceData;
    BackTransition *m_back = nullptr;
    QStack<QString> m_backStack;
};

} // namespace Raw
