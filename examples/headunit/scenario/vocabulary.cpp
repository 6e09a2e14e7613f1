#include "vocabulary.h"

#include "flow/building.h"
#include "hardkeys.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QRegularExpression>
#include <QVector>

#include <algorithm>
#include <numeric>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int maximumDistance = 3;

QStringList sortedWithoutDuplicates(QStringList names)
{
    names.removeAll(QString());
    names.removeDuplicates();
    names.sort();
    return names;
}

QList<HmiViewState *> viewStates()
{
    QList<HmiViewState *> views;
    const auto states = NamedState::namedStates();
    for (NamedState *state : states) {
        if (auto *view = qobject_cast<HmiViewState *>(state)) {
            views.append(view);
        }
    }
    return views;
}

// The number of characters to insert, remove or replace; case does not count.
int distance(const QString &from, const QString &to)
{
    QVector<int> row(to.size() + 1);
    std::iota(row.begin(), row.end(), 0);
    for (int i = 0; i < from.size(); ++i) {
        int diagonal = row[0]++;
        for (int j = 0; j < to.size(); ++j) {
            const int replaced = diagonal + (from[i].toLower() == to[j].toLower() ? 0 : 1);
            diagonal = row[j + 1];
            row[j + 1] = std::min({replaced, row[j] + 1, diagonal + 1});
        }
    }
    return row.last();
}

} // namespace

QStringList requestableNames()
{
    const QStringList names = viewStateNames() + viewIds();
    return sortedWithoutDuplicates(names + ViewLayer::domainNames());
}

// The state that stands for no popup in each layer is none to ask for.
QStringList popupNames()
{
    QStringList names;
    const auto states = NamedState::namedStates();
    for (const NamedState *state : states) {
        if (qobject_cast<const PopupState *>(state)
            && !state->name().endsWith(PopupState::noneStatePostfix())) {
            names.append(state->name());
        }
    }
    return sortedWithoutDuplicates(names);
}

QStringList viewIds()
{
    QStringList ids;
    const auto views = viewStates();
    for (const HmiViewState *view : views) {
        ids.append(view->targetView());
    }
    return sortedWithoutDuplicates(ids);
}

QStringList viewStateNames()
{
    QStringList names;
    const auto views = viewStates();
    for (const HmiViewState *view : views) {
        names.append(view->name());
    }
    return sortedWithoutDuplicates(names);
}

QStringList stateNames()
{
    QStringList names;
    const auto states = NamedState::namedStates();
    for (const NamedState *state : states) {
        names.append(state->name());
    }
    return sortedWithoutDuplicates(names);
}

QStringList keyNames()
{
    return HardKeys::names();
}

QStringList propertyNames()
{
    QStringList names = Vehicle::propertyNames();
    return names.replaceInStrings(QRegularExpression("^"), "vehicle.");
}

QString nearestName(const QString &name, const QStringList &names)
{
    QString nearest;
    int smallest = std::min(maximumDistance, name.size() / 2) + 1; // short names differ by less
    for (const QString &candidate : names) {
        const int current = distance(name, candidate);
        if (current < smallest) {
            smallest = current;
            nearest = candidate;
        }
    }
    return nearest;
}

} // namespace headunit
