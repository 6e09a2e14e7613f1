#include "plainview.h"

#include "viewlayer.h"
#include "viewsetup.h"

PlainView::PlainView(const QString &screen) : m_screen(screen)
{
    ::addInstanceData(this);
}

void PlainView::addInstanceData(const QString &key, const QVariant &value)
{
    m_instanceData.insert(key, value);
}

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
