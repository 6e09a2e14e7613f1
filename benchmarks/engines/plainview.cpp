#include "plainview.h"

#include "viewlayer.h"

void PlainView::enter(ViewLayer &layer, const QVariant &data)
{
    layer.resetScreenPopupBehavior();
    m_instanceData.insert(QStringLiteral("eventData"), data);
    m_instanceData.insert(QStringLiteral("entryReason"), 0);
    layer.activateView(m_screen, m_instanceData);
    Q_EMIT layer.activeViewDataChanged(QVariant());
}

void PlainView::leave(ViewLayer &layer)
{
    m_instanceData.insert(QStringLiteral("exitReason"), 0);
    layer.deactivateView(m_screen, m_instanceData);
}
