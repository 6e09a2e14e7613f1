#pragma once

#include "flowshape.h"
#include "libraryflow.h"
#include "rawflow.h"
#include "workload.h"

/** A side of a workload whose flow, a @p Work, is made from @p arguments. */
template <typename Work, typename... Arguments>
Workload::Side side(Engine engine, Arguments... arguments)
{
    return {engine, [=] { return std::make_unique<Work>(arguments...); }};
}

/** The same work on the library's flow and on the bare one. */
template <template <typename> class Work> QVector<Workload::Side> libraryAndRaw(FlowShape shape)
{
    return {side<Work<Library::ShapeFlow>>(Engine::Library, shape),
            side<Work<Raw::ShapeFlow>>(Engine::Raw, shape)};
}

/** How many memory layouts a flow with parallel regions is run under. */
constexpr int severalLayouts = 16;
