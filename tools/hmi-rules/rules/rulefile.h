#pragma once

#include "input/fault.h"
#include "input/jsonnode.h"
#include "input/textindex.h"

#include <QByteArray>
#include <QStringList>

namespace hmirules {

/** A place in one of the files of a rule base. */
struct Place
{
    int file = 0;
    TextPosition at;
    QString pointer; ///< JSON pointer; empty for the whole document
};

/**
 * Something in a file that can decide: a rule, a default or a blacklist. Those that the library
 * passes over are none.
 */
struct Site
{
    enum Kind { Rule, Default, DomainBlacklist, ViewBlacklist };

    Kind kind = Rule;
    Place place;
    int entry = 0; ///< index in its file
    QString popup; ///< of the entry, as it is written
    QString target; ///< of a rule, as it is written
    QString text; ///< the behaviour of a rule or a default, as it is written
    QStringList names; ///< of a blacklist
    std::vector<Place> namePlaces; ///< where each of them stands
    int begin = 0; ///< of what says which behaviour, or which is the first name
    int end = 0;
};

/** One file of rules: its bytes, and what stands where. */
class RuleFile
{
public:
    /** Reads the file at @p path. False with a fault when the library could not load it either. */
    bool read(const QByteArray &path, Fault *fault);

    /** The same for what has been read already. */
    bool take(const QString &name, const QByteArray &content, Fault *fault);

    QString name() const { return m_name; }
    QByteArray content() const { return m_content; }
    const JsonNode &root() const { return m_root; }

    Place place(const QString &pointer, int offset) const;
    Place place(const QString &pointer, const JsonNode &node) const
    {
        return place(pointer, node.begin);
    }

    /** In the order of the file. */
    std::vector<Site> sites() const;

    /** Which file of a rule base it is. */
    void setNumber(int number) { m_number = number; }

private:
    QString m_name;
    QByteArray m_content;
    TextIndex m_index = TextIndex(QByteArray());
    JsonNode m_root;
    int m_number = 0;
};

} // namespace hmirules
