#include "jsonreader.h"

#include "jsonhint.h"

#include <nlohmann/json.hpp>

#include <QJsonArray>
#include <QJsonDocument>
#include <QRegularExpression>
#include <QTextCodec>

#include <algorithm>
#include <cstring>
#include <iterator>

namespace hmirules {

namespace {

constexpr std::size_t maximumDepth = 1024; // QJsonDocument's own limit

constexpr char byteOrderMark[] = "\xef\xbb\xbf";

// With a byte order mark in front, which QString would take for one.
QString toKey(const std::string &text)
{
    const bool hasMark = text.compare(0, std::strlen(byteOrderMark), byteOrderMark) == 0;
    return (hasMark ? QString(QChar(QChar::ByteOrderMark)) : QString())
        + QString::fromStdString(text);
}

// QJsonDocument leaves a byte order mark in front out, unless there is an escape in the text.
QString toValue(const std::string &text, const QByteArray &token)
{
    const QString asKey = toKey(text);
    return asKey.startsWith(QChar(QChar::ByteOrderMark))
        ? QJsonDocument::fromJson('[' + token + ']').array().first().toString()
        : asKey;
}

/** Tells how far the reader has come, which its events do not. */
class Cursor
{
public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = const char *;
    using reference = const char &;

    Cursor(const char *at, const char **reached) : m_at(at), m_reached(reached) { }

    reference operator*() const { return *m_at; }
    Cursor &operator++()
    {
        *m_reached = ++m_at;
        return *this;
    }
    bool operator==(const Cursor &other) const { return m_at == other.m_at; }
    bool operator!=(const Cursor &other) const { return m_at != other.m_at; }

private:
    const char *m_at;
    const char **m_reached;
};

/** Makes the tree of the reader's events. */
class TreeBuilder : public nlohmann::json::json_sax_t
{
public:
    TreeBuilder(const QByteArray &content, const char *const *reached)
        : m_begin(content.constData()), m_end(m_begin + content.size()), m_tokenEnd(m_begin),
          m_reached(reached)
    {
        if (content.startsWith(byteOrderMark)) {
            m_tokenEnd += 3;
        }
    }

    bool null() override { return scalar(JsonNode::Null, takeToken()); }
    bool boolean(bool) override { return scalar(JsonNode::Bool, takeToken()); }
    bool number_integer(number_integer_t) override { return number(); }
    bool number_unsigned(number_unsigned_t) override { return number(); }
    bool number_float(number_float_t, const string_t &) override { return number(); }
    bool string(string_t &text) override
    {
        const int begin = takeToken();
        const QByteArray token(m_begin + begin, reachedOffset() - begin);
        return scalar(JsonNode::String, begin, toValue(text, token));
    }
    bool binary(binary_t &) override { return false; } // no text has it
    bool start_object(std::size_t) override { return open(JsonNode::Object); }
    bool start_array(std::size_t) override { return open(JsonNode::Array); }
    bool end_object() override { return close(); }
    bool end_array() override { return close(); }
    bool key(string_t &text) override
    {
        const int begin = takeToken();
        m_open.back().members.push_back({toKey(text), begin, JsonNode()});
        return true;
    }
    bool parse_error(std::size_t position, const std::string &,
                     const nlohmann::json::exception &exception) override
    {
        m_stop.offset = position == 0 ? 0 : static_cast<int>(position) - 1;
        m_stop.reason = QString::fromUtf8(exception.what());
        m_stop.token = std::min(takeToken(), m_stop.offset);
        return false;
    }

    JsonNode takeRoot() { return std::move(m_root); }
    const JsonStop &stop() const { return m_stop; }

private:
    Q_DISABLE_COPY(TreeBuilder)

    // Passes over what separates tokens to the one whose event this is; returns where it begins.
    int takeToken()
    {
        while (m_tokenEnd != m_end && *m_tokenEnd && std::strchr(" \t\r\n,:", *m_tokenEnd)) {
            ++m_tokenEnd;
        }
        const auto begin = static_cast<int>(m_tokenEnd - m_begin);
        m_tokenEnd = *m_reached;
        return begin;
    }

    int reachedOffset() const { return static_cast<int>(m_tokenEnd - m_begin); }

    bool scalar(JsonNode::Type type, int begin, const QString &text = QString())
    {
        JsonNode node;
        node.type = type;
        node.text = text;
        node.begin = begin;
        node.end = reachedOffset();
        append(std::move(node));
        return true;
    }

    // A number ends where the next character does not belong to it, which has been read by then.
    bool number()
    {
        const int begin = takeToken();
        if (!std::strchr("0123456789+-.eE", m_tokenEnd[-1])) {
            --m_tokenEnd;
        }
        return scalar(JsonNode::Number, begin);
    }

    bool open(JsonNode::Type type)
    {
        JsonNode node;
        node.type = type;
        node.begin = takeToken();
        m_open.push_back(std::move(node));
        if (m_open.size() > maximumDepth) {
            m_stop.offset = m_open.back().begin;
            m_stop.reason = QString("nested deeper than %1 levels").arg(maximumDepth);
            return false;
        }
        return true;
    }

    bool close()
    {
        takeToken();
        JsonNode node = std::move(m_open.back());
        m_open.pop_back();
        node.end = reachedOffset();
        append(std::move(node));
        return true;
    }

    void append(JsonNode &&node)
    {
        if (m_open.empty()) {
            m_root = std::move(node);
        } else if (m_open.back().type == JsonNode::Array) {
            m_open.back().items.push_back(std::move(node));
        } else {
            m_open.back().members.back().value = std::move(node);
        }
    }

    const char *m_begin;
    const char *m_end;
    const char *m_tokenEnd;
    const char *const *m_reached;
    std::vector<JsonNode> m_open;
    JsonNode m_root;
    JsonStop m_stop;
};

bool isUtf8(const QByteArray &content)
{
    QTextCodec::ConverterState state;
    QTextCodec::codecForName("UTF-8")->toUnicode(content.constData(), content.size(), &state);
    return state.invalidChars == 0 && state.remainingChars == 0;
}

// "[json.exception.parse_error.101] parse error at line 1, column 2: syntax error ..." without what
// stands in the place of the message already.
QString withoutPlace(const QString &text)
{
    static const QRegularExpression place("^\\[json\\.[^]]*\\] (parse error at [^:]*: )?");
    return QString(text).remove(place);
}

} // namespace

bool readJson(const QByteArray &content, const TextIndex &index, JsonNode *root, Fault *fault)
{
    if (content.contains('\0') && isUtf8(content)) { // it would end the text for the reader below
        fault->at = index.positionOf(content.indexOf('\0'));
        fault->message = "not JSON: a byte of zero, as UTF-16 has them";
        fault->remedy = "save the file in the encoding UTF-8.";
        return false;
    }
    const char *reached = content.constData();
    TreeBuilder builder(content, &reached);
    const Cursor begin(content.constData(), &reached);
    const Cursor end(content.constData() + content.size(), &reached);
    if (nlohmann::json::sax_parse(begin, end, &builder)) {
        *root = builder.takeRoot();
        return true;
    }
    const JsonStop &stop = builder.stop();
    if (!isUtf8(content)) {
        fault->at = index.positionOf(stop.offset);
        fault->message = "not UTF-8";
        fault->remedy = "save the file in the encoding UTF-8.";
        return false;
    }
    const JsonHint hint = jsonHint(content, stop);
    const bool isKnown = !hint.message.isEmpty();
    fault->at = index.positionOf(isKnown ? hint.offset : stop.offset);
    fault->message = "not JSON: " + (isKnown ? hint.message : withoutPlace(stop.reason));
    fault->remedy = isKnown ? hint.remedy : QString("mend it, or name another file.");
    return false;
}

} // namespace hmirules
