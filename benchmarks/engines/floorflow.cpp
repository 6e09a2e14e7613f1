#include "floorflow.h"

FloorViewSwitch::FloorViewSwitch(const FlowShape &shape) : m_screens(shape.screens())
{
    for (const QString &screen : qAsConst(m_screens)) {
        m_views.insert(screen, PlainView(screen));
    }
    m_active = m_screens.first();
    m_views.find(m_active)->enter(m_layer, QVariant());
}

void FloorViewSwitch::run(int operations)
{
    for (int i = 0; i < operations; ++i) {
        m_next = nextIndex(m_next, m_screens.size());
        m_views.find(m_active)->leave(m_layer);
        m_active = m_screens.at(m_next);
        m_views.find(m_active)->enter(m_layer, i);
    }
}
