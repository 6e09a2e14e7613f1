#include "keypress.h"
#include "lifecycle.h"
#include "lookups.h"
#include "popuprounds.h"
#include "probes.h"
#include "viewswitch.h"

QVector<Workload> allWorkloads()
{
    return viewSwitchWorkloads() + popupRoundWorkloads() + keyPressWorkloads()
        + lifecycleWorkloads() + lookupWorkloads() + probeWorkloads();
}
