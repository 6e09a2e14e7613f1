#include "findinglist.h"

namespace hmirules {

namespace {

QString asText(const FindingKind &kind)
{
    return QString("%1 (%2): %3.\n    On the target: %4\n    Remedy: %5\n")
        .arg(kind.id, severityText(kind.severity), kind.title, kind.effect, kind.remedy);
}

// A text as it is: names with asterisks are no emphasis.
QString escaped(QString text)
{
    return text.replace('*', "\\*").replace('<', "\\<").replace('[', "\\[");
}

QString asMarkdown(const FindingKind &kind)
{
    return QString("### `%1`\n\n*%2.* %3.\n\n**On the target:** %4\n\n**Remedy:** %5\n")
        .arg(kind.id, severityText(kind.severity), escaped(kind.title), escaped(kind.effect),
             escaped(kind.remedy));
}

QString list(const FindingKind *kind, QString (*form)(const FindingKind &))
{
    if (kind) {
        return form(*kind);
    }
    QStringList texts;
    for (const FindingKind &each : findingKinds()) {
        texts.append(form(each));
    }
    return texts.join('\n');
}

} // namespace

QString findingsAsText(const FindingKind *kind)
{
    return list(kind, asText);
}

QString findingsAsMarkdown(const FindingKind *kind)
{
    return list(kind, asMarkdown);
}

} // namespace hmirules
