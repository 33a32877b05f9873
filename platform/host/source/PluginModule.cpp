#include "tov/host/PluginModule.h"

#include <dlfcn.h>

namespace {

template <class Fn>
bool Bind(void* handle, const char* name, Fn& fn, std::string& missing) {
    fn = reinterpret_cast<Fn>(dlsym(handle, name));
    if (!fn && missing.empty()) missing = name;
    return fn != nullptr;
}

}  // namespace

std::unique_ptr<PluginModule> PluginModule::Open(const std::string& path, TOVRESULT& result, std::string& error) {
    dlerror();
    void* handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (!handle) {
        const char* why = dlerror();
        error = "cannot load module " + path + ": " + (why ? why : "unknown error");
        result = TOV_E_FILEOPEN;
        return nullptr;
    }
    std::unique_ptr<PluginModule> module(new PluginModule(path, handle));
    std::string missing;
    Bind(handle, "TOVRegisterPlugin", module->RegisterPlugin, missing);
    Bind(handle, "TOVRegisterComponent", module->RegisterComponent, missing);
    Bind(handle, "TOVGetClassFactory", module->GetClassFactory, missing);
    Bind(handle, "TOVCanUnloadNow", module->CanUnloadNow, missing);
    Bind(handle, "TOVStartup", module->Startup, missing);
    Bind(handle, "TOVShutdown", module->Shutdown, missing);
    if (!missing.empty()) {
        error = "module " + path + " does not export " + missing;
        result = ZEB_E_NOTFOUND;
        return nullptr;
    }
    result = TOV_OK;
    return module;
}

PluginModule::~PluginModule() {
    if (!m_KeepLoaded) dlclose(m_Handle);
}
