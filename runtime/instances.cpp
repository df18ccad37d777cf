// Instances: name resolution, member setters and readers, creation and destruction with
// their events, and the default instance.
#include "runtime/instances.h"

#include "runtime/errors.h"
#include "runtime/event_frame.h"
#include "runtime/host_services.h"
#include "runtime/name_table.h"
#include "runtime/parameters.h"
#include "runtime/routines.h"

#include <memory>
#include <utility>

namespace morvex::runtime {
namespace {

// The member `member` of `instance`, or null when no member of that name is declared. The
// value belongs to the instance.
Value *memberOf(RunObject &object, InstanceRecord &instance, const char *member) {
  const std::int32_t index = lookupNameIndex(object.memberNames.data(), object.memberCount, member);
  if (index < 0 || index >= instance.valueCount()) {
    return nullptr;
  }
  return &instance.values[static_cast<std::size_t>(index)];
}

// The member an action writes, or null after raising the error that says why not
// (`missingInstance` when `instance` is none, then 3 for an undeclared member). The value
// belongs to the instance; it is handed out only when no event has run in between.
Value *memberToWrite(RunObject &object, InstanceRecord *instance, std::int32_t missingInstance,
                     const char *member) {
  if (instance == object.noInstance()) {
    raiseActionError(object, missingInstance);
    return nullptr;
  }
  Value *value = memberOf(object, *instance, member);
  if (!value) {
    raiseActionError(object, kNoSuchVariable);
  }
  return value;
}

// The member an expression reads, or null after recording the expression error that says
// why not. The value belongs to the instance.
const Value *memberToRead(RunObject &object, InstanceRecord *instance, std::int32_t missingInstance,
                          const char *member) {
  if (instance == object.noInstance()) {
    raiseExpressionError(object, missingInstance);
    return nullptr;
  }
  const Value *value = memberOf(object, *instance, member);
  if (!value) {
    raiseExpressionError(object, kNoSuchVariable);
  }
  return value;
}

// Marks no result type: an integer result.
void markNothing(RunObject &) {
}

// The member of the named instance that the expression's two parameters name (owned by the
// instance), or null after recording why not; `mark` sets the result's type bit after the
// fetches and before any check.
const Value *namedMemberToRead(RunObject &object, HostWord cookie, void (*mark)(RunObject &)) {
  const char *instanceName = fetchFirstExpressionText(object, cookie);
  const char *member = fetchNextExpressionText(object, cookie);
  mark(object);
  return memberToRead(object, resolveInstance(object, instanceName), kNoSuchInstance, member);
}

// The same for the member of the current instance that the expression's parameter names.
const Value *currentMemberToRead(RunObject &object, HostWord cookie, void (*mark)(RunObject &)) {
  const char *member = fetchFirstExpressionText(object, cookie);
  mark(object);
  return memberToRead(object, object.currentInstance, kNoCurrentInstance, member);
}

// Links `record` in at its sorted place without ever replacing an element, so the record
// itself (not a copy) lives on in `list`.
void insertSorted(InstanceList &list, std::unique_ptr<InstanceRecord> record) {
  InstanceRecord *at = list.first();
  while (at != list.end() && at->name < record->name) {
    at = at->next;
  }
  list.insertBefore(at, std::move(record));
}

// Where "Destroy All Instances" keeps the busy instances it meets. When the pass ends, on
// whatever path, they go back into the object's list as the same records, so the running
// calls and events and the default instance that refer to them stay valid.
class HoldingList {
public:
  explicit HoldingList(RunObject &object) : object_(object) {}
  ~HoldingList() {
    while (held_.size() > 0) {
      insertSorted(object_.instances, held_.unlink(held_.first()));
    }
  }
  HoldingList(const HoldingList &) = delete;
  HoldingList &operator=(const HoldingList &) = delete;

  // Moves `instance` out of the object's list into the holding list.
  void hold(InstanceRecord *instance) { insertSorted(held_, object_.instances.unlink(instance)); }

private:
  RunObject &object_;
  InstanceList held_;
};

// Destroys an idle instance: its destruction event in its own event frame, then the
// default instance reset and the record removed. Being busy during the event, the
// instance is still in the list when the event ends.
void destroyIdleInstance(RunObject &object, InstanceRecord &instance) {
  {
    const EventFrame frame(object, instance);
    generateEvent(object, host::kOnDestruction);
  }
  if (object.defaultInstance == &instance) {
    object.defaultInstance = object.noInstance();
  }
  object.instances.remove(&instance);
}

} // namespace

InstanceRecord *resolveInstance(RunObject &object, const char *name) {
  if (name && *name) {
    return object.instances.find(name);
  }
  return object.defaultInstance;
}

void setMemberInteger(RunObject &object, HostWord, HostWord) {
  const char *instanceName = fetchActionText(object);
  const char *member = fetchActionText(object);
  const std::int32_t integer = fetchActionInteger(object);
  if (Value *value =
          memberToWrite(object, resolveInstance(object, instanceName), kNoSuchInstance, member)) {
    value->intValue = integer;
  }
}

void setMemberFloat(RunObject &object, HostWord, HostWord) {
  const char *instanceName = fetchActionText(object);
  const char *member = fetchActionText(object);
  const float real = fetchActionFloat(object);
  if (Value *value =
          memberToWrite(object, resolveInstance(object, instanceName), kNoSuchInstance, member)) {
    value->floatValue = real;
  }
}

void setMemberString(RunObject &object, HostWord, HostWord) {
  const char *instanceName = fetchActionText(object);
  const char *member = fetchActionText(object);
  const char *text = fetchActionText(object);
  if (Value *value =
          memberToWrite(object, resolveInstance(object, instanceName), kNoSuchInstance, member)) {
    value->stringValue = text ? text : "";
  }
}

void setCurrentMemberInteger(RunObject &object, HostWord member, HostWord integer) {
  if (Value *value = memberToWrite(object, object.currentInstance, kNoCurrentInstance,
                                   reinterpret_cast<const char *>(member))) {
    value->intValue = static_cast<std::int32_t>(integer);
  }
}

void setCurrentMemberFloat(RunObject &object, HostWord member, HostWord) {
  const float real = fetchActionParamFloat(object, 1);
  if (Value *value = memberToWrite(object, object.currentInstance, kNoCurrentInstance,
                                   reinterpret_cast<const char *>(member))) {
    value->floatValue = real;
  }
}

void setCurrentMemberString(RunObject &object, HostWord member, HostWord text) {
  if (Value *value = memberToWrite(object, object.currentInstance, kNoCurrentInstance,
                                   reinterpret_cast<const char *>(member))) {
    const auto *string = reinterpret_cast<const char *>(text);
    value->stringValue = string ? string : "";
  }
}

HostWord intOfInstance(RunObject &object, HostWord cookie) {
  const Value *value = namedMemberToRead(object, cookie, markNothing);
  return value ? value->intValue : 0;
}

HostWord floatOfInstance(RunObject &object, HostWord cookie) {
  const Value *value = namedMemberToRead(object, cookie, markFloatResult);
  return floatResult(value ? value->floatValue : 0.0f);
}

// String results are the member's own text: valid until the member is set again or the
// instance is destroyed.
HostWord stringOfInstance(RunObject &object, HostWord cookie) {
  const Value *value = namedMemberToRead(object, cookie, markStringResult);
  return value ? textResult(value->stringValue) : emptyTextResult();
}

HostWord intOfCurrInstance(RunObject &object, HostWord cookie) {
  const Value *value = currentMemberToRead(object, cookie, markNothing);
  return value ? value->intValue : 0;
}

HostWord floatOfCurrInstance(RunObject &object, HostWord cookie) {
  const Value *value = currentMemberToRead(object, cookie, markFloatResult);
  return floatResult(value ? value->floatValue : 0.0f);
}

HostWord stringOfCurrInstance(RunObject &object, HostWord cookie) {
  const Value *value = currentMemberToRead(object, cookie, markStringResult);
  return value ? textResult(value->stringValue) : emptyTextResult();
}

// The current instance's own name, valid while the instance lives.
HostWord getInstanceName(RunObject &object, HostWord) {
  markStringResult(object);
  if (object.currentInstance == object.noInstance()) {
    raiseExpressionError(object, kNoCurrentInstance);
    return emptyTextResult();
  }
  return textResult(object.currentInstance->name);
}

void createInstance(RunObject &object, HostWord name, HostWord parameters) {
  const auto *instanceName = reinterpret_cast<const char *>(name);
  if (!instanceName || !*instanceName) {
    raiseActionError(object, kEmptyInstanceName);
    return;
  }
  if (object.instances.find(instanceName) != object.noInstance()) {
    raiseActionError(object, kInstanceExists);
    return;
  }
  InstanceRecord *instance = object.instances.insertOrReplace(
      std::make_unique<InstanceRecord>(instanceName, object.memberCount));
  const EventFrame frame(object, *instance);
  object.parameterCount =
      bindParameters(reinterpret_cast<const char *>(parameters), *object.localVariables);
  generateEvent(object, host::kOnCreation);
}

void destroyInstance(RunObject &object, HostWord name, HostWord) {
  InstanceRecord *instance = resolveInstance(object, reinterpret_cast<const char *>(name));
  if (instance == object.noInstance()) {
    raiseActionError(object, kNoSuchInstance);
    return;
  }
  if (instance->instanceBusy != 0) {
    raiseActionError(object, kInstanceBusy);
    return;
  }
  destroyIdleInstance(object, *instance);
}

void destroyAllInstances(RunObject &object, HostWord, HostWord) {
  HoldingList holding(object);
  while (object.instances.size() > 0) {
    InstanceRecord *instance = object.instances.first();
    if (instance->instanceBusy != 0) {
      raiseActionError(object, kInstanceBusy);
      // A busy instance outlives the "On Error" lines and is back in the list after them.
      holding.hold(instance);
    } else {
      destroyIdleInstance(object, *instance);
    }
  }
}

void setDefaultInstance(RunObject &object, HostWord name, HostWord) {
  InstanceRecord *instance = object.instances.find(reinterpret_cast<const char *>(name));
  if (instance == object.noInstance()) {
    raiseActionError(object, kNoSuchInstance);
    return;
  }
  object.defaultInstance = instance;
}

} // namespace morvex::runtime
