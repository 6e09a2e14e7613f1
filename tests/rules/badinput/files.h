#pragma once

#include <QByteArray>
#include <QFile>
#include <QString>

/** A file of rules with a finding. */
constexpr char remark[] = R"([{"popup": "phone/call", "default": "Nein"}])";

/** One without. */
constexpr char fine[] = R"([{"popup": "phone/call", "default": "Allow"}])";

inline bool write(const QString &path, const QByteArray &content)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

/** The first line. */
inline QByteArray first(const QByteArray &text)
{
    return text.left(text.indexOf('\n'));
}
