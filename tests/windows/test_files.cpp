// Paths from the environment.
#include "tests/windows/test_files.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>

namespace morvex::tests {

std::string fileFromEnvironment(const char *variable) {
  const char *value = std::getenv(variable);
  if (value == nullptr || *value == '\0') {
    ADD_FAILURE() << variable << " is not set: run this program through CTest";
    return {};
  }
  std::string path = value;
  if (path.front() == '/') {
    path = "Z:" + path;
  }
  std::replace(path.begin(), path.end(), '/', '\\');
  return path;
}

} // namespace morvex::tests
