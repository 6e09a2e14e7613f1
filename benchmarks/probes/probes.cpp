#include "probes.h"

#include "libraryprobes.h"
#include "regionprobes.h"
#include "transitionprobes.h"
#include "treeprobes.h"

QVector<Workload> probeWorkloads()
{
    return regionProbes() + treeProbes() + transitionProbes() + libraryProbes();
}
