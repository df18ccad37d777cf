// The run-time header the host hands every object, with its service slots wired to a
// HostServices implementation (the running game).
#ifndef MORVEX_EMULATOR_HOST_SERVICES_H
#define MORVEX_EMULATOR_HOST_SERVICES_H

#include "host/contract.h"

#include <memory>
#include <string>

namespace morvex::emulator {

// What the extension's calls back into the host reach. Implementations must not throw.
class HostServices {
public:
  virtual ~HostServices() = default;
  virtual host::HostWord generateEvent(host::ObjectHeader *object, host::HostWord code) = 0;
  virtual host::HostWord fetchActionParam(host::HostWord mode) = 0;
  virtual host::HostWord fetchActionParamFloat(host::HostWord index) = 0;
  virtual host::HostWord fetchFirstExpressionParam(host::HostWord type, host::HostWord cookie) = 0;
  virtual host::HostWord fetchNextExpressionParam(host::HostWord type, host::HostWord cookie) = 0;
  // Something failed inside the host while a service ran (out of memory): stop the game.
  virtual void abandon(const std::string &why) noexcept = 0;
};

// A RunHeader followed by the services it leads to. The header comes first, so the
// RunHeader pointer in an object's header leads back here.
struct HostRunHeader {
  host::RunHeader header;
  HostServices *services;
};

// A zeroed run-time header whose service slots call `services`, which must outlive it.
std::unique_ptr<HostRunHeader> makeRunHeader(HostServices &services);

} // namespace morvex::emulator

#endif
