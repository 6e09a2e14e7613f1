#pragma once

#include "steps.h"

#include <functional>
#include <optional>

class MessageRecorder;
class World;

/** A rule beside those that must always hold: asked after each step, empty when it holds. */
using ExtraRule = std::function<QString(const World &, const Step &)>;

/** Makes the rule anew for each run, for rules that count. */
using MakeRule = std::function<ExtraRule()>;

/** The first step after which a rule is broken: the steps up to it are the shortest prefix. */
struct Failure
{
    int step;
    QString rule;
};

/** Runs lists of steps in worlds of one seed, each list from the start. */
class Runner
{
public:
    Runner(quint32 seed, MessageRecorder &messages, const MakeRule &makeRule = MakeRule());

    std::optional<Failure> run(const QVector<Step> &steps) const;

    /** The shortest prefix of @p steps that fails; empty when none does. */
    QVector<Step> shortestFailingPrefix(const QVector<Step> &steps) const;

    /** What is left of @p failing when each step is dropped that the failure does without. */
    QVector<Step> reduced(QVector<Step> failing) const;

    /** How to see the failure again, and the steps that lead to it; empty when nothing fails. */
    QString report(const QVector<Step> &steps) const;

private:
    quint32 m_seed;
    MessageRecorder &m_messages;
    MakeRule m_makeRule;
};
