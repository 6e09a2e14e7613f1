#include "run.h"

#include "invariants.h"
#include "world.h"

#include <QStringList>

namespace {

QString listed(const QVector<Step> &steps)
{
    QStringList lines;
    for (const Step &step : steps) {
        lines.append("  " + toText(step));
    }
    return lines.join('\n');
}

} // namespace

Runner::Runner(quint32 seed, MessageRecorder &messages, const MakeRule &makeRule)
    : m_seed(seed), m_messages(messages), m_makeRule(makeRule)
{
}

std::optional<Failure> Runner::run(const QVector<Step> &steps) const
{
    World world(m_seed, m_messages);
    const ExtraRule extraRule = m_makeRule ? m_makeRule() : ExtraRule();
    for (int i = 0; i < steps.size(); ++i) {
        world.apply(steps.at(i));
        QString broken = brokenRule(world);
        if (broken.isEmpty() && extraRule) {
            broken = extraRule(world, steps.at(i));
        }
        if (!broken.isEmpty()) {
            return Failure{i, broken};
        }
    }
    return std::nullopt;
}

// Every step is checked, so the prefix that ends with the first failure is the shortest one; that
// it fails again shows that nothing but the seed decides.
QVector<Step> Runner::shortestFailingPrefix(const QVector<Step> &steps) const
{
    const auto failure = run(steps);
    if (!failure) {
        return {};
    }
    const QVector<Step> prefix = steps.mid(0, failure->step + 1);
    const auto again = run(prefix);
    return again && again->step == failure->step ? prefix : steps;
}

QVector<Step> Runner::reduced(QVector<Step> failing) const
{
    for (int chunk = failing.size() / 2; chunk > 0; chunk /= 2) {
        for (int begin = failing.size() - chunk; begin >= 0; begin -= chunk) {
            QVector<Step> fewer = failing;
            fewer.remove(begin, chunk);
            if (const auto failure = run(fewer)) {
                failing = fewer.mid(0, failure->step + 1);
                begin = qMin(begin, failing.size());
            }
        }
    }
    return failing;
}

QString Runner::report(const QVector<Step> &steps) const
{
    const QVector<Step> prefix = shortestFailingPrefix(steps);
    const auto failure = run(prefix);
    if (!failure) {
        return QString();
    }
    const QVector<Step> few = reduced(prefix);
    return QStringLiteral("Broken: %1\n"
                          "HMI_RANDOM_SEED=%2 HMI_RANDOM_STEPS=%3, the shortest prefix:\n%4\n"
                          "Of these, %5 break a rule too:\n%6\n")
        .arg(failure->rule)
        .arg(m_seed)
        .arg(prefix.size())
        .arg(listed(prefix))
        .arg(few.size())
        .arg(listed(few));
}
