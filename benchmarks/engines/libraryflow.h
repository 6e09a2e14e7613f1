#pragma once

#include "flowshape.h"
#include "keysource.h"
#include "machineflow.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>

namespace Library {

/** The flow of a shape, built with the library. */
class ShapeFlow : public LibraryFlow
{
public:
    explicit ShapeFlow(const FlowShape &shape);
    ~ShapeFlow() override;

protected:
    void requestView(const QString &id, int data);
    void requestBack();
    void requestPopup(const QString &name, int data);
    QString dismissIdentifier(const QString &popup) const;
    void dismissPopup(const QString &identifier);

    const QStringList &screens() const { return m_screenIds; }
    QState *viewParent() const { return m_viewParent; }
    KeySource &keys() { return m_keys; }

private:
    void showPopupsOnce(const QStringList &names);
    void buildLayers(int count);
    void buildViews(const FlowShape &shape);
    void buildPopups(const FlowShape &shape);

    KeySource m_keys;
    QStringList m_screenIds;
    QState *m_viewParent;
    HmiStateMachine::HmiLayeredState *m_innermost = nullptr;
};

} // namespace Library
