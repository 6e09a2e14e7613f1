#include "inventory.h"

#include "inputfile.h"
#include "jsonreader.h"

#include <QHash>

namespace hmirules {

namespace {

/** Reads one file of names into an inventory; whichever fault comes first ends it. */
class InventoryReader
{
public:
    InventoryReader(const QByteArray &content, Inventory *inventory, Fault *fault)
        : m_content(content), m_index(content), m_inventory(inventory), m_fault(fault)
    {
    }

    bool readJsonObject();
    bool readLines(void (InventoryReader::*add)(const QString &));
    void addPopupLine(const QString &line);
    void addDomain(const QString &name) { m_inventory->domains.append(name); }
    void addView(const QString &id) { m_inventory->views.append(id); }

private:
    bool readMember(const JsonMember &member);
    bool readPopups(const JsonNode &list);
    bool readPopup(const JsonNode &node);
    bool hasKnownKeys(const JsonNode &popup);
    bool readNames(const JsonNode &list, QStringList *names);
    bool refuse(int offset, const QString &message, const QString &remedy);
    bool expect(const JsonNode &node, JsonNode::Type type);

    void addPopup(const QString &name, const QString &viewId, int offset);

    QByteArray m_content;
    TextIndex m_index;
    Inventory *m_inventory;
    Fault *m_fault;
    int m_lineBegin = 0;
};

void InventoryReader::addPopup(const QString &name, const QString &viewId, int offset)
{
    m_inventory->popups.append({name, viewId, m_fault->file, m_index.positionOf(offset)});
}

bool InventoryReader::refuse(int offset, const QString &message, const QString &remedy)
{
    m_fault->at = m_index.positionOf(offset);
    m_fault->message = message;
    m_fault->remedy = remedy;
    return false;
}

bool InventoryReader::expect(const JsonNode &node, JsonNode::Type type)
{
    return node.type == type
        || refuse(node.begin,
                  "expected " + typeText(type) + " in the inventory, found " + typeText(node.type),
                  "see \"hmi-rules lint --help\" for an example.");
}

bool InventoryReader::readJsonObject()
{
    JsonNode root;
    if (!readJson(m_content, m_index, &root, m_fault) || !expect(root, JsonNode::Object)) {
        return false;
    }
    for (const JsonMember &member : root.members) {
        if (!readMember(member)) {
            return false;
        }
    }
    return true;
}

bool InventoryReader::readMember(const JsonMember &member)
{
    if (member.key == "popups") {
        m_inventory->hasPopups = true;
        return readPopups(member.value);
    }
    if (member.key == "domains") {
        m_inventory->hasDomains = true;
        return readNames(member.value, &m_inventory->domains);
    }
    if (member.key == "views") {
        m_inventory->hasViews = true;
        return readNames(member.value, &m_inventory->views);
    }
    return refuse(member.begin, "unknown key \"" + member.key + "\" in the inventory",
                  R"(it may have "popups", "domains" and "views".)");
}

bool InventoryReader::readPopups(const JsonNode &list)
{
    if (!expect(list, JsonNode::Array)) {
        return false;
    }
    for (const JsonNode &node : list.items) {
        if (!readPopup(node)) {
            return false;
        }
    }
    return true;
}

bool InventoryReader::hasKnownKeys(const JsonNode &popup)
{
    for (const JsonMember &member : popup.members) {
        if (member.key != "name" && member.key != "viewId") {
            return refuse(member.begin,
                          "unknown key \"" + member.key + "\" of a popup in the inventory",
                          R"(it may have "name" and "viewId".)");
        }
    }
    return true;
}

bool InventoryReader::readPopup(const JsonNode &node)
{
    const bool isName = node.type == JsonNode::String;
    if (!isName && !(expect(node, JsonNode::Object) && hasKnownKeys(node))) {
        return false;
    }
    const QString name = isName ? node.text : node.string("name");
    const QString viewId = node.value("viewId") ? node.string("viewId") : name;
    if (name.isEmpty() || viewId.isEmpty()) {
        return refuse(node.begin,
                      "a popup of the inventory without a name or with an empty view id",
                      R"(write {"name": "phone/call", "viewId": "CallBanner"}.)");
    }
    addPopup(name, viewId, node.begin);
    return true;
}

bool InventoryReader::readNames(const JsonNode &list, QStringList *names)
{
    if (!expect(list, JsonNode::Array)) {
        return false;
    }
    for (const JsonNode &node : list.items) {
        if (!expect(node, JsonNode::String)) {
            return false;
        }
        names->append(node.text);
    }
    return true;
}

// One name a line; what begins with "#" is a comment.
bool InventoryReader::readLines(void (InventoryReader::*add)(const QString &))
{
    m_lineBegin = 0;
    for (const QByteArray &line : m_content.split('\n')) {
        const QString name = QString::fromUtf8(line).trimmed();
        if (name.contains(QChar::ReplacementCharacter)) {
            return refuse(m_lineBegin, "not UTF-8", "save the file in the encoding UTF-8.");
        }
        if (!name.isEmpty() && !name.startsWith('#')) {
            (this->*add)(name);
        }
        m_lineBegin += line.size() + 1;
    }
    return true;
}

// A view id that differs from the name follows it after a tabulator.
void InventoryReader::addPopupLine(const QString &line)
{
    const QString name = line.section('\t', 0, 0).trimmed();
    const QString viewId = line.section('\t', 1).trimmed();
    addPopup(name, viewId.isEmpty() ? name : viewId, m_lineBegin);
}

bool readList(const QByteArray &path, void (InventoryReader::*add)(const QString &), bool *has,
              Inventory *inventory, Fault *fault)
{
    if (path.isEmpty()) {
        return true;
    }
    *has = true;
    QByteArray content;
    return readInput(path, &content, fault)
        && InventoryReader(content, inventory, fault).readLines(add);
}

// Two places that tell different view ids of one popup cannot both be right.
bool isConsistent(const Inventory &inventory, Fault *fault)
{
    QHash<QString, Inventory::Popup> told;
    for (const Inventory::Popup &popup : inventory.popups) {
        const auto known = told.constFind(popup.name);
        if (known != told.constEnd() && known->viewId != popup.viewId) {
            *fault = Fault();
            fault->file = popup.file;
            fault->at = popup.at;
            fault->message = QString(R"(the popup "%1" has the view id "%2" here and "%3" at %4)")
                                 .arg(popup.name, popup.viewId, known->viewId,
                                      placeText(known->file, known->at));
            fault->remedy = "tell one of them, in the inventory or the list of popups.";
            return false;
        }
        told.insert(popup.name, popup);
    }
    return true;
}

} // namespace

QStringList Inventory::popupNames() const
{
    QStringList names;
    for (const Popup &popup : popups) {
        names.append(popup.name);
    }
    names.removeDuplicates();
    return names;
}

QStringList Inventory::popupViewIds() const
{
    QStringList ids;
    for (const Popup &popup : popups) {
        ids.append(popup.viewId);
    }
    ids.removeDuplicates();
    return ids;
}

QString Inventory::viewIdOf(const QString &name) const
{
    for (const Popup &popup : popups) {
        if (popup.name == name) {
            return popup.viewId;
        }
    }
    return name;
}

bool readInventory(const Options &options, Inventory *inventory, Fault *fault)
{
    QByteArray content;
    if (!options.inventory.isEmpty()
        && !(readInput(options.inventory, &content, fault)
             && InventoryReader(content, inventory, fault).readJsonObject())) {
        return false;
    }
    return readList(options.popupList, &InventoryReader::addPopupLine, &inventory->hasPopups,
                    inventory, fault)
        && readList(options.domainList, &InventoryReader::addDomain, &inventory->hasDomains,
                    inventory, fault)
        && readList(options.viewList, &InventoryReader::addView, &inventory->hasViews, inventory,
                    fault)
        && isConsistent(*inventory, fault);
}

} // namespace hmirules
