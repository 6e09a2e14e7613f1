#include "stores.h"

#include "interruptions.h"
#include "rules/names.h"

using namespace HmiStateMachine;
using namespace hmirules;

StorePointer loaded(const QList<QByteArray> &contents)
{
    auto store = std::make_unique<PopupInterruptionStore>();
    for (const QByteArray &content : contents) {
        if (!loadInterruptions(*store, content)) {
            return nullptr;
        }
    }
    return store;
}

std::vector<RuleFile> filesOf(const QList<QByteArray> &contents)
{
    std::vector<RuleFile> files;
    for (const QByteArray &content : contents) {
        RuleFile file;
        Fault fault;
        if (!file.take("rules, %1 %2 of " + QString::number(files.size()), content, &fault)) {
            return {};
        }
        files.push_back(std::move(file));
    }
    return files;
}

QStringList namesToAsk(const RuleBase &base)
{
    constexpr int limit = 28;
    QStringList names = {"unknown", "unknown/unknown", "(any other) "};
    const QStringList written = namesIn(base);
    for (const QString &name : written) {
        names.append(name);
        if (name.contains('*')) {
            names.append(QString(name).replace('*', "unknown"));
        }
    }
    names.removeDuplicates();
    return names.mid(0, limit);
}

QStringList placesToAsk(const RuleBase &base, Site::Kind kind)
{
    QStringList places = {"unknown"};
    for (const Site &site : base.sites()) {
        if (site.kind == kind) {
            places += site.names;
        }
    }
    places.removeDuplicates();
    return places;
}

bool isBlocked(const PopupInterruptionStore &store, const QString &popup, const QString &where,
               Site::Kind kind)
{
    return kind == Site::DomainBlacklist ? store.isBlockedByDomain(popup, numberOfDomain(where))
                                         : store.isBlockedByView(popup, where);
}

QString pairText(const QString &front, const QString &requested)
{
    return QString("\"%1\" in front, \"%2\" requested").arg(front, requested);
}
