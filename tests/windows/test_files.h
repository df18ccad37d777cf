// The files the checks read, named by the environment CTest gives the program.
#ifndef MORVEX_TESTS_WINDOWS_TEST_FILES_H
#define MORVEX_TESTS_WINDOWS_TEST_FILES_H

#include <string>

namespace morvex::tests {

// The path in `variable`, in Windows form (a Unix path "/x/y" becomes "Z:\x\y", the drive
// on which Wine shows the Unix root); empty, and the test failed, when it is not set.
std::string fileFromEnvironment(const char *variable);

} // namespace morvex::tests

#endif
