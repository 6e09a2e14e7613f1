#pragma once

#include <QString>
#include <QVector>

#include <functional>
#include <memory>

/** One engine's side of a workload: built by its maker, measured by the harness. */
class Flow
{
public:
    virtual ~Flow() = default;

    /** What has to be there before the measured part and is not measured itself. */
    virtual void before(int operations) { Q_UNUSED(operations) }

    /** The measured part. */
    virtual void run(int operations) = 0;

    /** What undoes run(), not measured. */
    virtual void after() { }

    /** What the flow has shown or answered so far, order-sensitive. */
    virtual quint64 checksum() const = 0;
};

enum class Engine { Library, Raw, Scxml, Floor };

/** The name of @p engine in reports: "library", "raw", "scxml", "floor". */
QString engineName(Engine engine);

using FlowMaker = std::function<std::unique_ptr<Flow>()>;

/** One row of the table: the same work, done by several engines. */
struct Workload
{
    QString id; ///< "W1/1000"
    QString title; ///< for the reader of the table
    int timed; ///< operations in one timed round
    int counted; ///< operations in one count of instructions or allocations
    int warmUp; ///< operations before anything is measured
    int layouts; ///< memory layouts of which the cheapest counts; 1 where the layout is no matter

    struct Side
    {
        Engine engine;
        FlowMaker make;
    };
    QVector<Side> sides;
};

/** Runs @p flow until first times are over: caches filled, views entered once. */
void warmUp(Flow &flow, const Workload &workload);

/** Every workload, in the order of the table. */
QVector<Workload> allWorkloads();
