// The service entry points in the host's calling convention. Nothing thrown inside the
// host may cross into the extension's frames, so each one catches everything.
#include "emulator/host_services.h"

#include <cstring>
#include <exception>
#include <type_traits>

namespace morvex::emulator {

namespace {

static_assert(std::is_standard_layout_v<HostRunHeader>);

HostServices &servicesOf(host::ObjectHeader *object) {
  return *reinterpret_cast<HostRunHeader *>(object->runHeader)->services;
}

template <class Work>
host::HostWord guarded(host::ObjectHeader *object, Work &&work) noexcept {
  HostServices &services = servicesOf(object);
  try {
    return work(services);
  } catch (const std::exception &error) {
    services.abandon(error.what());
  } catch (...) {
    services.abandon("an unknown failure inside the host");
  }
  return 0;
}

host::HostWord MORVEX_CALL generateEvent(host::ObjectHeader *object, host::HostWord code,
                                         host::HostWord) {
  return guarded(object, [&](HostServices &s) { return s.generateEvent(object, code); });
}

host::HostWord MORVEX_CALL fetchActionParam(host::ObjectHeader *object, host::HostWord mode,
                                            host::HostWord) {
  return guarded(object, [&](HostServices &s) { return s.fetchActionParam(mode); });
}

host::HostWord MORVEX_CALL fetchActionParamFloat(host::ObjectHeader *object, host::HostWord index,
                                                 host::HostWord) {
  return guarded(object, [&](HostServices &s) { return s.fetchActionParamFloat(index); });
}

host::HostWord MORVEX_CALL fetchFirstExpressionParam(host::ObjectHeader *object,
                                                     host::HostWord type, host::HostWord cookie) {
  return guarded(object,
                 [&](HostServices &s) { return s.fetchFirstExpressionParam(type, cookie); });
}

host::HostWord MORVEX_CALL fetchNextExpressionParam(host::ObjectHeader *object, host::HostWord type,
                                                    host::HostWord cookie) {
  return guarded(object, [&](HostServices &s) { return s.fetchNextExpressionParam(type, cookie); });
}

} // namespace

std::unique_ptr<HostRunHeader> makeRunHeader(HostServices &services) {
  auto runHeader = std::make_unique<HostRunHeader>();
  std::memset(&runHeader->header, 0, sizeof runHeader->header);
  runHeader->header.GenerateEvent = generateEvent;
  runHeader->header.FetchActionParam = fetchActionParam;
  runHeader->header.FetchActionParamFloat = fetchActionParamFloat;
  runHeader->header.FetchFirstExpressionParam = fetchFirstExpressionParam;
  runHeader->header.FetchNextExpressionParam = fetchNextExpressionParam;
  runHeader->services = &services;
  return runHeader;
}

} // namespace morvex::emulator
