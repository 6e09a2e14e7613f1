#include "optiontext.h"

using namespace hmirules;

namespace {

class Text
{
public:
    void add(const char *member, const QString &value)
    {
        if (!value.isEmpty()) {
            m_parts.append(QString("%1=%2").arg(member, value));
        }
    }

    void add(const char *member, const QList<QByteArray> &values)
    {
        add(member, QString::fromUtf8(QByteArrayList(values).join(',')));
    }

    template <typename Enum> void add(const char *member, Enum value, Enum usual, QStringList names)
    {
        add(member, value == usual ? QString() : names.value(int(value), "none of its values"));
    }

    QString text() const { return m_parts.join(' '); }

private:
    QStringList m_parts;
};

} // namespace

QString optionText(const Options &options)
{
    const Options usual;
    Text text;
    text.add("command",
             QStringList({"lint", "explain", "matrix", "diff", "schema", "findings"})
                 .value(int(options.command)));
    text.add("files", options.files);
    text.add("base", options.base);
    text.add("inventory", QList<QByteArray>({options.inventory}));
    text.add("popups", QList<QByteArray>({options.popupList}));
    text.add("domains", QList<QByteArray>({options.domainList}));
    text.add("views", QList<QByteArray>({options.viewList}));
    text.add("format", options.format, usual.format,
             {"text", "json", "sarif", "csv", "html", "markdown"});
    text.add("output", QList<QByteArray>({options.output}));
    text.add("color", options.color, usual.color, {"auto", "always", "never"});
    text.add("failOn", options.failOn, usual.failOn, {"note", "warning", "error"});
    text.add("ignore", options.ignore.join(','));
    text.add("each", options.each ? "true" : "");
    text.add("front", options.front);
    text.add("requested", options.requested);
    text.add("domain", options.domains.join(','));
    text.add("view", options.views.join(','));
    text.add("blocking", options.blocking ? "true" : "");
    text.add("only", options.only.join(','));
    text.add("finding", options.finding);
    return text.text();
}
