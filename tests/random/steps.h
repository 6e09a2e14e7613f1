#pragma once

#include "seeds.h"

#include <QString>
#include <QVector>

enum class Action {
    Request, ///< popup first
    RequestTwo, ///< popups first and second, both posted before either is handled
    DismissAndRequest, ///< popup first, by name, and popup second, likewise
    Dismiss, ///< popup first, by its name
    DismissView, ///< popup first, by its popup view id
    DismissCurrent, ///< the popup in front of layer first
    DismissAny,
    RequestUnknown, ///< a name that no layer holds
    Domain, ///< the active domain becomes first
    View, ///< the active view becomes first
    Report, ///< the view layer reports what it has shown and hidden
    Timeout, ///< the next running timer, from popup first on, runs out
    DriverRestriction, ///< the property becomes first
    React, ///< an event that some popups react to without being left
    Reset, ///< layer first
    Clear, ///< layer first
    StoreBlocked, ///< switched to first
    LeaveAndReturn ///< both layers are left and entered again
};

struct Step
{
    Action action;
    int first;
    int second;
};

constexpr int popupCount = 30;
constexpr int layerCount = 2;
constexpr int domainCount = 4;
constexpr int viewCount = 4;

/** The first @p count steps of @p seed: a longer list begins with the shorter one. */
QVector<Step> makeSteps(quint32 seed, int count);

/** "request 7", the form in which steps are printed. */
QString toText(const Step &step);
