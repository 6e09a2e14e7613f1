#pragma once

#include <QMap>
#include <QString>
#include <QVariant>

class ViewLayer;

/** What a view tells the view layer, for engines that bring no view class of their own. */
class PlainView
{
public:
    explicit PlainView(const QString &screen) : m_screen(screen) { }

    void enter(ViewLayer &layer, const QVariant &data);
    void leave(ViewLayer &layer);

private:
    QString m_screen;
    QMap<QString, QVariant> m_instanceData;
};
