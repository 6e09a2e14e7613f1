#include "results.h"

#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>

namespace {

const Engine engines[] = {Engine::Library, Engine::Raw, Engine::Scxml, Engine::Floor};

QString key(const char *text)
{
    return QString::fromLatin1(text);
}

QJsonObject toJson(const SideResult &side)
{
    return {{key("instructions"), side.instructions},
            {key("allocations"), side.allocations},
            {key("heapBytes"), side.heapBytes},
            {key("nanoseconds"), side.nanoseconds}};
}

QJsonObject toJson(const TimeRatio &ratio)
{
    return {{key("median"), ratio.median}, {key("low"), ratio.low}, {key("high"), ratio.high}};
}

SideResult sideFrom(const QJsonObject &json)
{
    return {json.value(key("instructions")).toDouble(), json.value(key("allocations")).toDouble(),
            json.value(key("heapBytes")).toDouble(), json.value(key("nanoseconds")).toDouble()};
}

TimeRatio ratioFrom(const QJsonObject &json)
{
    return {json.value(key("median")).toDouble(), json.value(key("low")).toDouble(),
            json.value(key("high")).toDouble()};
}

WorkloadResult rowFrom(const QJsonObject &json)
{
    WorkloadResult result;
    result.id = json.value(key("id")).toString();
    result.title = json.value(key("title")).toString();
    const QJsonObject sides = json.value(key("sides")).toObject();
    const QJsonObject ratios = json.value(key("timeRatios")).toObject();
    for (Engine engine : engines) {
        const QString name = engineName(engine);
        if (sides.contains(name)) {
            result.sides.insert(engine, sideFrom(sides.value(name).toObject()));
        }
        if (ratios.contains(name)) {
            result.timeRatios.insert(engine, ratioFrom(ratios.value(name).toObject()));
        }
    }
    return result;
}

} // namespace

QString engineName(Engine engine)
{
    switch (engine) {
    case Engine::Library:
        return key("library");
    case Engine::Raw:
        return key("raw");
    case Engine::Scxml:
        return key("scxml");
    case Engine::Floor:
        return key("floor");
    }
    return QString();
}

double WorkloadResult::instructionRatio(Engine engine) const
{
    const double other = sides.value(engine).instructions;
    return other > 0 ? sides.value(Engine::Library).instructions / other : 0;
}

const WorkloadResult *find(const Results &results, const QString &id)
{
    const auto it = std::find_if(results.cbegin(), results.cend(),
                                 [&id](const WorkloadResult &row) { return row.id == id; });
    return it == results.cend() ? nullptr : &*it;
}

QJsonObject toJson(const Results &results)
{
    QJsonArray rows;
    for (const WorkloadResult &result : results) {
        QJsonObject sides;
        QJsonObject ratios;
        for (auto it = result.sides.cbegin(); it != result.sides.cend(); ++it) {
            sides.insert(engineName(it.key()), toJson(it.value()));
        }
        for (auto it = result.timeRatios.cbegin(); it != result.timeRatios.cend(); ++it) {
            ratios.insert(engineName(it.key()), toJson(it.value()));
        }
        rows.append(QJsonObject{{key("id"), result.id},
                                {key("title"), result.title},
                                {key("sides"), sides},
                                {key("timeRatios"), ratios}});
    }
    return {{key("workloads"), rows}};
}

Results fromJson(const QByteArray &text, QString *error)
{
    QJsonParseError parseError;
    const QJsonDocument document = QJsonDocument::fromJson(text, &parseError);
    if (parseError.error != QJsonParseError::NoError) {
        *error =
            QStringLiteral("%1 at byte %2").arg(parseError.errorString()).arg(parseError.offset);
        return Results();
    }
    Results results;
    const QJsonArray rows = document.object().value(key("workloads")).toArray();
    for (const QJsonValue &row : rows) {
        results.append(rowFrom(row.toObject()));
        if (results.last().id.isEmpty()) {
            *error = QStringLiteral("workload %1 has no id").arg(results.size());
            return Results();
        }
    }
    if (results.isEmpty()) {
        *error = QStringLiteral("no workloads in it");
    }
    return results;
}
