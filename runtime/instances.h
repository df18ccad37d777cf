// Turning an instance name into one of the object's instances.
#ifndef MORVEX_RUNTIME_INSTANCES_H
#define MORVEX_RUNTIME_INSTANCES_H

#include "runtime/run_object.h"

namespace morvex::runtime {

// The instance named `name` in any letter case; for an empty or missing name the default
// instance. noInstance() when there is none. The record belongs to object.instances.
InstanceRecord *resolveInstance(RunObject &object, const char *name);

} // namespace morvex::runtime

#endif
