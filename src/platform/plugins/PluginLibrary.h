#pragma once
// A shared library loaded at run time (dlopen), closed when the object goes. The loader
// knows nothing of what a library is for: it opens, finds symbols and closes.

#include <memory>
#include <string>

namespace nedit {

class PluginLibrary {
  public:
    /// Opens the library at `path` with every symbol bound at once, so that a missing one
    /// fails here rather than at its first call. Null, with the loader's reason in `error`,
    /// when it cannot be opened.
    static std::unique_ptr<PluginLibrary> Open(const std::string& path, std::string& error);
    ~PluginLibrary();
    PluginLibrary(const PluginLibrary&) = delete;
    PluginLibrary& operator=(const PluginLibrary&) = delete;

    const std::string& Path() const { return path_; }
    /// The address of `name`, or null when the library does not export it.
    void* Symbol(const char* name) const;

    /// The function `name` as the pointer type `Function`; null when missing.
    template <class Function>
    Function Get(const char* name) const {
        return reinterpret_cast<Function>(Symbol(name));
    }

  private:
    PluginLibrary(std::string path, void* handle) : path_(std::move(path)), handle_(handle) {}

    std::string path_;
    void* handle_;
};

}  // namespace nedit
