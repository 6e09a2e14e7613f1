#pragma once

#include "flowshape.h"
#include "plainview.h"
#include "viewlayer.h"
#include "workload.h"

#include <QHash>

/** A view switch without a machine: a table of views and the calls on the view layer. */
class FloorViewSwitch : public Flow
{
public:
    explicit FloorViewSwitch(const FlowShape &shape);

    void run(int operations) override;
    quint64 checksum() const override { return m_layer.checksum(); }

private:
    ViewLayer m_layer;
    QStringList m_screens;
    QHash<QString, PlainView> m_views;
    QString m_active;
    int m_next = 0;
};
