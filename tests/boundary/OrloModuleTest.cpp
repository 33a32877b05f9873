// The module's six exports as a host meets them: the catalogue, the start-up
// on hosts that lack a service, the argument checks that differ on purpose,
// and unloading only once every object is gone.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "LoadedModule.h"
#include "boundary/OrloRegInfo.h"
#include "tov/IFTFManager.h"
#include "tov/host/PluginModule.h"
#include "tov/sdk/TOVComponent.h"

namespace {

using namespace OrloRegInfo;

std::unique_ptr<PluginModule> OpenModule() {
    TOVRESULT result = TOV_OK;
    std::string error;
    auto module = PluginModule::Open(ORLO_MODULE, result, error);
    EXPECT_TRUE(module) << error;
    return module;
}

// A host that lacks a service. Without a console, its unknown hands out the
// real host's factory (where the utility library finds a console) but answers
// no console itself; without toggles, it is its own factory, which makes no
// toggle manager.
class PartialHost : public ITOVComponentFactory, public CTOVUnknown {
public:
    enum Lacks { kConsole, kToggles };
    // Lives on the stack: the count starts at one so that no release deletes it.
    PartialHost(TOVHost& real, Lacks lacks) : CTOVUnknown(nullptr), m_Real(real), m_Lacks(lacks) { InternalAddRef(); }
    TOV_FORWARD_UNKNOWN
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override {
        if (iid == IID_ITOVComponentFactory && m_Lacks == kConsole) return m_Real.QueryInterface(iid, out);
        if (iid == IID_ITOVComponentFactory) return TOVExpose<ITOVComponentFactory>(this, out);
        if (iid == IID_ITOVConsole && m_Lacks == kToggles) return m_Real.QueryInterface(iid, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    }
    TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out) override {
        if (compID == TOVCompID_FTFManager) return ZEB_E_NOTFOUND;
        return m_Real.CreateComponent(compID, outer, iid, out);
    }
    TOVRESULT GetClassFactory(const _tovUID& clsid, const _tovUID& iid, void** out) override {
        return m_Real.GetClassFactory(clsid, iid, out);
    }
    TOVRESULT GetComponentDefinition(const _tovUID& compID, const _tovUID& iid, void** out) override {
        return m_Real.GetComponentDefinition(compID, iid, out);
    }
    ITOVUnknown* Unknown() { return static_cast<ITOVComponentFactory*>(this); }

private:
    TOVHost& m_Real;
    Lacks m_Lacks;
};

TEST(OrloModule, CataloguesThePlugInAndItsSevenComponents) {
    LoadedModule loaded;
    ASSERT_EQ(loaded.host->LoadedPlugins().size(), 1u);
    ITOVPluginDefinition* plugin = loaded.host->LoadedPlugins()[0];
    EXPECT_STREQ(plugin->GetName(), L"Orlo Plug-In");
    EXPECT_EQ(plugin->GetComponentCount(), 7u);
    std::vector<std::wstring> names;
    for (const auto& entry : loaded.host->Registry().Entries()) names.push_back(entry.definition->GetName());
    const std::vector<std::wstring> expected = {L"OrloReaderMediaFormat",
                                                L"OrloReaderSequences",
                                                L"OrloReaderMasterClips",
                                                L"OrloReaderDocumentHandler",
                                                L"OrloReaderMovMediaContainer",
                                                L"OrloReaderMovSampleMapping",
                                                L"OrloReaderClips"};
    // The host's own components come first.
    ASSERT_GE(names.size(), expected.size());
    EXPECT_EQ(std::vector<std::wstring>(names.end() - 7, names.end()), expected);
    const auto hasLine = [&](const std::string& text) {
        for (const auto& line : loaded.host.Texts())
            if (line == text) return true;
        return false;
    };
    EXPECT_TRUE(hasLine("Orlo Plug-In 1.9.1.10178 Loaded"));
}

TEST(OrloModule, EntryPointsRefuseBadArgumentsEachInItsOwnWay) {
    LoadedModule loaded;
    auto module = OpenModule();  // the same code and globals as the loaded one
    ITOVUnknown* host = loaded.host->AsUnknown();
    ITOVPluginDefinition* plugin = nullptr;
    ITOVComponentDefinition* component = nullptr;
    void* out = nullptr;
    const struct {
        const char* name;
        TOVRESULT result, expected;
    } cases[] = {
        {"plug-in without host", module->RegisterPlugin(nullptr, &plugin), TOV_E_POINTER},
        {"class factory without host",
         module->GetClassFactory(nullptr, CLSID_OrloReaderClips, IID_ITOVClassFactory, &out), TOV_E_INVALIDARG},
        {"component index 7", module->RegisterComponent(host, 7, &component), TOV_E_INVALIDARG},
        {"component id for a class id",
         module->GetClassFactory(host, CompID_OrloReaderClips, IID_ITOVClassFactory, &out), CLASS_E_CLASSNOTAVAILABLE},
        {"unload query without host", module->CanUnloadNow(nullptr), TOV_E_INVALIDARG},
        {"second start-up", module->Startup(host), ZEB_E_ALREADYSET},
    };
    for (const auto& c : cases) EXPECT_EQ(c.result, c.expected) << c.name;
    // The repeated start raised the library's count: a shutdown pays for it.
    module->Shutdown(host);
}

TEST(OrloModule, StartsWithoutAConsoleButNotWithoutToggles) {
    TestHost real;
    auto module = OpenModule();
    {
        PartialHost noConsole(*real, PartialHost::kConsole);
        EXPECT_EQ(module->Startup(noConsole.Unknown()), TOV_OK);
        for (const std::string& line : real.Texts()) EXPECT_EQ(line.find("Loaded"), std::string::npos) << line;
        // The shutdown's own console query fails, and that is thrown at the host.
        EXPECT_THROW(module->Shutdown(noConsole.Unknown()), int);
        module->Shutdown(real->AsUnknown());
    }
    {
        PartialHost noToggles(*real, PartialHost::kToggles);
        EXPECT_EQ(module->Startup(noToggles.Unknown()), ZEB_E_NOTFOUND);
        // A failed start-up undoes nothing: the library stays started.
        module->Shutdown(real->AsUnknown());
    }
}

TEST(OrloModule, UnloadsOnlyOnceEveryObjectAndFactoryIsReleased) {
    LoadedModule loaded;
    TOVPtr<ITOVClassFactory> factory;
    ASSERT_EQ(loaded.host->GetClassFactory(CLSID_OrloReaderMovContainer, IID_ITOVClassFactory, factory.Out()), TOV_OK);
    TOVPtr<IMediaContainer3> container = loaded.Container("");
    container.Reset();
    EXPECT_EQ(loaded.host->UnloadModule(ORLO_MODULE), TOV_E_NOTSUPPORTED);
    factory.Reset();
    EXPECT_EQ(loaded.host->UnloadModule(ORLO_MODULE), TOV_OK);
}

}  // namespace
