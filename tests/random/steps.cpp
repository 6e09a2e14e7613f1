#include "steps.h"

namespace {

/** What an action is called, how often it comes and how far its arguments go. */
struct ActionTraits
{
    Action action;
    const char *name;
    int weight;
    int firstLimit;
    int secondLimit;
};

constexpr ActionTraits allTraits[] = {
    {Action::Request, "request", 34, popupCount, 1},
    {Action::RequestTwo, "request two", 8, popupCount, popupCount},
    {Action::DismissAndRequest, "dismiss and request", 4, popupCount, popupCount},
    {Action::Dismiss, "dismiss", 7, popupCount, 1},
    {Action::DismissView, "dismiss view", 3, popupCount, 1},
    {Action::DismissCurrent, "dismiss current of layer", 10, layerCount, 1},
    {Action::DismissAny, "dismiss any", 2, 1, 1},
    {Action::RequestUnknown, "request unknown", 1, 1, 1},
    {Action::Domain, "domain", 6, domainCount, 1},
    {Action::View, "view", 4, viewCount, 1},
    {Action::Report, "report", 9, 1, 1},
    {Action::Timeout, "timeout from", 5, popupCount, 1},
    {Action::DriverRestriction, "driver restriction", 2, 2, 1},
    {Action::React, "react", 1, 1, 1},
    {Action::Reset, "reset layer", 1, layerCount, 1},
    {Action::Clear, "clear layer", 1, layerCount, 1},
    {Action::StoreBlocked, "store blocked", 1, 2, 1},
    {Action::LeaveAndReturn, "leave and return", 1, 1, 1},
};

constexpr int totalWeight()
{
    int sum = 0;
    for (const ActionTraits &traits : allTraits) {
        sum += traits.weight;
    }
    return sum;
}

const ActionTraits &pick(int number)
{
    const ActionTraits *traits = allTraits;
    while (number >= traits->weight) {
        number -= traits->weight;
        ++traits;
    }
    return *traits;
}

} // namespace

QVector<Step> makeSteps(quint32 seed, int count)
{
    Random random(seed);
    QVector<Step> steps;
    steps.reserve(count);
    for (int i = 0; i < count; ++i) {
        const ActionTraits &traits = pick(random.below(totalWeight()));
        const int first = random.below(traits.firstLimit);
        steps.append({traits.action, first, random.below(traits.secondLimit)});
    }
    return steps;
}

QString toText(const Step &step)
{
    for (const ActionTraits &traits : allTraits) {
        if (traits.action == step.action) {
            QString text = QString::fromLatin1(traits.name);
            if (traits.firstLimit > 1) {
                text += ' ' + QString::number(step.first);
            }
            if (traits.secondLimit > 1) {
                text += ' ' + QString::number(step.second);
            }
            return text;
        }
    }
    return QString();
}
