// The extension library loaded the way a host loads it: dlopen, then entry points by name.
#ifndef MORVEX_TESTS_HOST_LOADED_LIBRARY_H
#define MORVEX_TESTS_HOST_LOADED_LIBRARY_H

#include <dlfcn.h>

#include <cstring>
#include <string>

namespace morvex::tests {

class LoadedLibrary {
public:
  explicit LoadedLibrary(const char *path) : handle_(dlopen(path, RTLD_NOW | RTLD_LOCAL)) {
    if (handle_ == nullptr) {
      error_ = dlerror();
    }
  }
  ~LoadedLibrary() {
    if (handle_ != nullptr) {
      dlclose(handle_);
    }
  }
  LoadedLibrary(const LoadedLibrary &) = delete;
  LoadedLibrary &operator=(const LoadedLibrary &) = delete;

  bool loaded() const { return handle_ != nullptr; }
  const std::string &error() const { return error_; }

  // The entry point `name` as a `Function` pointer, or null when the library has none.
  // The pointer is valid while the library stays loaded.
  template <class Function>
  Function entry(const char *name) const {
    void *symbol = handle_ == nullptr ? nullptr : dlsym(handle_, name);
    Function function = nullptr;
    static_assert(sizeof function == sizeof symbol);
    std::memcpy(&function, &symbol, sizeof function);
    return function;
  }

private:
  void *handle_;
  std::string error_;
};

} // namespace morvex::tests

#endif
