#pragma once

#include "flowshape.h"
#include "plainview.h"
#include "viewlayer.h"
#include "workload.h"

#include <QScxmlStateMachine>

#include <memory>
#include <vector>

/**
 * The flow of a shape as a document of Qt SCXML, interpreted: one state a view, and one transition
 * a view on the state around them, since a document cannot compute the target of a transition.
 */
class ScxmlShapeFlow : public Flow
{
public:
    explicit ScxmlShapeFlow(const FlowShape &shape);
    ~ScxmlShapeFlow() override;

    quint64 checksum() const override { return m_layer.checksum(); }

protected:
    void requestView(int index, int data);

    /** Submits an event and lets the machine run until it has nothing left to do. */
    void submit(const QString &name, const QVariant &data);

    int viewCount() const { return m_requests.size(); }

private:
    void followView(const QString &name, const QString &screen);

    ViewLayer m_layer;
    std::unique_ptr<QScxmlStateMachine> m_machine;
    std::vector<std::unique_ptr<PlainView>> m_views;
    QStringList m_requests;
    QVariant m_data;
};
