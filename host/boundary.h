// What every exported entry point is made of: C linkage, the host's calling convention,
// and no exception crossing into the host.
#ifndef MORVEX_HOST_BOUNDARY_H
#define MORVEX_HOST_BOUNDARY_H

#include "host/contract.h"

// On Windows the module-definition file (host/morvex.def) names and numbers the exports;
// on Linux they are the library's visible symbols, limited by host/exports.map.
#if defined(_WIN32)
#define MORVEX_EXPORT extern "C"
#else
#define MORVEX_EXPORT extern "C" __attribute__((visibility("default")))
#endif

namespace morvex::host {

// Runs `work` and answers its result, or `failure` if it throws.
template <class Work, class Result>
Result callGuarded(Work &&work, Result failure) noexcept {
  try {
    return work();
  } catch (...) {
    return failure;
  }
}

// Runs `work`, which gives no result, and swallows anything it throws.
template <class Work>
void callGuarded(Work &&work) noexcept {
  try {
    work();
  } catch (...) {
    // Nothing to report to: the host expects no result.
  }
}

} // namespace morvex::host

#endif
