#pragma once

#include "flowshape.h"

/** Gives @p view, of whichever engine, the values that it hands to the view layer. */
template <typename View> void addInstanceData(View *view)
{
    for (int key = 0; key < FlowShape::instanceKeys; ++key) {
        view->addInstanceData(FlowShape::instanceKey(key), key);
    }
}
