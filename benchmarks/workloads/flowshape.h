#pragma once

#include <QString>
#include <QStringList>

/** What a flow of views looks like; every engine builds the same flow from the same shape. */
struct FlowShape
{
    int views = 10;

    /** How many layered states lie around the views, each within the one before. */
    int layers = 0;

    /** Popups in the innermost layer. */
    int popups = 0;

    /** Each popup is shown and dismissed once before anything is measured. */
    bool popupsShownBefore = false;

    /** Key transitions on every view. */
    int keys = 0;

    /** Views are asked for by a screen id that is no view's name. */
    bool byScreen = false;

    /** Every view leads back to where it was entered from. */
    bool back = false;

    QStringList viewNames() const;
    QStringList screens() const;
    QStringList popupNames() const;
};

/** The element after @p index of a round through @p count of them, in an order that jumps. */
inline int nextIndex(int index, int count)
{
    constexpr int stride = 7; // divides none of the counts used here
    return (index + stride) % count;
}
