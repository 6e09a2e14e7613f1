#include "jsonhint.h"

#include <algorithm>
#include <cctype>

namespace hmirules {

namespace {

bool isLetter(char byte)
{
    return std::isalpha(static_cast<unsigned char>(byte)) != 0;
}

// Those of word processors, single and double, up and down.
bool isTypographicQuote(const QByteArray &text)
{
    const char *const quotes[] = {"\xe2\x80\x98", "\xe2\x80\x99", "\xe2\x80\x9c", "\xe2\x80\x9d",
                                  "\xe2\x80\x9e"};
    return std::any_of(std::begin(quotes), std::end(quotes),
                       [&text](const char *quote) { return text.startsWith(quote); });
}

bool wantsEndOfList(const QString &reason)
{
    return reason.endsWith("expected ']'") || reason.endsWith("expected '}'");
}

// A character where a value or a name should begin.
JsonHint hintForCharacter(const QByteArray &content, int offset)
{
    const char here = content.at(offset);
    const char before = offset > 0 ? content.at(offset - 1) : '\0';
    if (here == '/' || before == '/') {
        return {"a comment, which JSON does not have", "remove it.", offset};
    }
    if (here == '\'' || isTypographicQuote(content.mid(offset))) {
        return {"this is no quotation mark of JSON", "write \" in its place.", offset};
    }
    if (isLetter(here) && before == '"') {
        return {"text behind the end of a quotation",
                "look for a quotation mark that is missing before it, or is one too many.", offset};
    }
    if (isLetter(here)) {
        return {"a word without quotation marks", "write \" before and behind it.", offset};
    }
    return {};
}

// A piece that would be right in another place.
JsonHint hintForToken(const QByteArray &content, const JsonStop &stop)
{
    const bool closes =
        stop.reason.contains("unexpected ']'") || stop.reason.contains("unexpected '}'");
    if (closes && content.left(stop.offset).trimmed().endsWith(',')) {
        return {"a comma with nothing behind it", "remove the comma.", stop.offset};
    }
    if (closes && wantsEndOfList(stop.reason)) {
        return {QString("a %1 is missing before this").arg(stop.reason.chopped(1).right(1)),
                "write it, or remove this.", stop.offset};
    }
    if (!closes && wantsEndOfList(stop.reason)) {
        return {"a comma is missing before this", "write it.", stop.token};
    }
    if (stop.reason.endsWith("expected ':'")) {
        return {"a colon is missing before this", "write it.", stop.token};
    }
    return {};
}

} // namespace

JsonHint jsonHint(const QByteArray &content, const JsonStop &stop)
{
    if (content.trimmed().isEmpty()) {
        return {"nothing is in it", "name another file.", 0};
    }
    if (stop.reason.contains("unexpected end of input")) {
        return {"it ends too early", "close what is open, with } or ].", content.size()};
    }
    if (stop.reason.contains("missing closing quote") || stop.reason.contains("U+000A")) {
        return {"a quotation mark that is not closed in its line", "close it.", stop.token};
    }
    if (stop.reason.endsWith("expected end of input")) {
        return {"something stands behind the end", "remove it.", stop.token};
    }
    return stop.reason.contains("invalid literal") && stop.offset < content.size()
        ? hintForCharacter(content, stop.offset)
        : hintForToken(content, stop);
}

} // namespace hmirules
