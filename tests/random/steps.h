#pragma once

#include <QString>
#include <QVector>

#include <random>

/** The same numbers from the same seed on every platform, which std's distributions do not give. */
class Random
{
public:
    explicit Random(quint32 seed) : m_engine(seed) { }

    /** 0 up to, and without, @p limit. */
    int below(int limit) { return static_cast<int>(m_engine() % static_cast<quint32>(limit)); }
    bool oneIn(int chances) { return below(chances) == 0; }

private:
    std::mt19937 m_engine;
};

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
