// Loading the extension: dlopen/dlsym on POSIX systems, LoadLibrary/GetProcAddress on
// Windows.
#include "emulator/library.h"

#if defined(_WIN32)
#include <windows.h>
#else
#include <dlfcn.h>
#include <limits.h>
#include <unistd.h>
#endif

namespace morvex::emulator {

#if defined(_WIN32)

std::unique_ptr<Library> Library::open(const std::string &path, std::string &error) {
  HMODULE module = LoadLibraryA(path.c_str());
  if (module == nullptr) {
    error = "LoadLibrary failed with error " + std::to_string(GetLastError());
    return nullptr;
  }
  return std::unique_ptr<Library>(new Library(module));
}

Library::~Library() {
  FreeLibrary(static_cast<HMODULE>(handle_));
}

void *Library::find(const char *name) const {
  return reinterpret_cast<void *>(GetProcAddress(static_cast<HMODULE>(handle_), name));
}

std::string programFolder() {
  char path[MAX_PATH] = {};
  const DWORD length = GetModuleFileNameA(nullptr, path, MAX_PATH);
  if (length == 0 || length >= MAX_PATH) {
    return "";
  }
  std::string folder(path, length);
  const std::size_t slash = folder.find_last_of("\\/");
  return slash == std::string::npos ? "" : folder.substr(0, slash + 1);
}

#else

std::unique_ptr<Library> Library::open(const std::string &path, std::string &error) {
  void *handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
  if (handle == nullptr) {
    const char *why = dlerror();
    error = why != nullptr ? why : "dlopen failed";
    return nullptr;
  }
  return std::unique_ptr<Library>(new Library(handle));
}

Library::~Library() {
  dlclose(handle_);
}

void *Library::find(const char *name) const {
  return dlsym(handle_, name);
}

std::string programFolder() {
  char path[PATH_MAX];
  const ssize_t length = readlink("/proc/self/exe", path, sizeof path - 1);
  if (length <= 0) {
    return "";
  }
  std::string folder(path, static_cast<std::size_t>(length));
  const std::size_t slash = folder.rfind('/');
  return slash == std::string::npos ? "" : folder.substr(0, slash + 1);
}

#endif

} // namespace morvex::emulator
