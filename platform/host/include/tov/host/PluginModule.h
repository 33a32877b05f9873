#pragma once
/// One plug-in module opened with dlopen, with its six exports bound.
#include <memory>
#include <string>

#include "tov/TOVPluginExports.h"

class PluginModule {
public:
    /// Opens the module at `path` and binds all six exports. On failure returns
    /// null and describes it in `error`: TOV_E_FILEOPEN when the module cannot
    /// be loaded, ZEB_E_NOTFOUND when an export is missing.
    static std::unique_ptr<PluginModule> Open(const std::string& path, TOVRESULT& result, std::string& error);
    /// Closes the module.
    ~PluginModule();

    PluginModule(const PluginModule&) = delete;
    PluginModule& operator=(const PluginModule&) = delete;

    const std::string& GetPath() const { return m_Path; }
    /// Keeps the code mapped at destruction, for a module whose objects outlive it.
    void KeepLoaded() { m_KeepLoaded = true; }

    TOVRegisterPluginFn RegisterPlugin = nullptr;
    TOVRegisterComponentFn RegisterComponent = nullptr;
    TOVGetClassFactoryFn GetClassFactory = nullptr;
    TOVCanUnloadNowFn CanUnloadNow = nullptr;
    TOVStartupFn Startup = nullptr;
    TOVShutdownFn Shutdown = nullptr;

private:
    PluginModule(std::string path, void* handle) : m_Path(std::move(path)), m_Handle(handle) {}

    std::string m_Path;
    void* m_Handle;
    bool m_KeepLoaded = false;
};
