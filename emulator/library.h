// A dynamic library opened by path, and the addresses of the names it exports.
#ifndef MORVEX_EMULATOR_LIBRARY_H
#define MORVEX_EMULATOR_LIBRARY_H

#include <memory>
#include <string>

namespace morvex::emulator {

class Library {
public:
  // Opens the library at `path`; nothing, with `error` set, when it cannot be loaded.
  static std::unique_ptr<Library> open(const std::string &path, std::string &error);
  ~Library(); // unloads it: every address it gave is invalid from then on
  Library(const Library &) = delete;
  Library &operator=(const Library &) = delete;

  // The address of exported `name`, valid while this Library lives; null when missing.
  void *find(const char *name) const;

private:
  explicit Library(void *handle) : handle_(handle) {}
  void *handle_;
};

// Where the running program's own file lies (its folder, with a trailing separator);
// empty when unknown.
std::string programFolder();

} // namespace morvex::emulator

#endif
