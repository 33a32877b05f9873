// Loading plug-in modules from disk: cataloguing, creating through the host,
// unloading, and the failures a person must be able to read.
#include <gtest/gtest.h>

#include <string>

#include "TestEcho.h"
#include "TestHost.h"

namespace {

std::string ModulePath(const char* variant) {
    return std::string(TEST_MODULE_DIR) + "/orlo_test_module_" + variant + ".so";
}

class ModuleLoading : public ::testing::Test {
protected:
    TestHost host;
    std::string error;
};

TEST_F(ModuleLoading, LoadsCataloguesAndStartsAModule) {
    ASSERT_EQ(host->LoadModule(ModulePath("full"), error), TOV_OK) << error;
    ASSERT_EQ(host->LoadedPlugins().size(), 1u);
    EXPECT_STREQ(host->LoadedPlugins()[0]->GetName(), L"Test Module");
    EXPECT_EQ(host.Texts(), std::vector<std::string>{"Test Module 2.3 Loaded"});

    TOVPtr<ITestEcho> echo;
    ASSERT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, echo.Out()), TOV_OK);
    EXPECT_EQ(echo->Echo(41), 42);
}

TEST_F(ModuleLoading, UnloadWaitsForTheModulesObjects) {
    const std::string path = ModulePath("full");
    ASSERT_EQ(host->LoadModule(path, error), TOV_OK) << error;
    TOVPtr<ITestEcho> echo;
    ASSERT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, echo.Out()), TOV_OK);
    EXPECT_EQ(host->UnloadModule(path), TOV_E_NOTSUPPORTED);
    EXPECT_EQ(echo->Echo(1), 2) << "the module stays while its object lives";
    echo.Reset();
    EXPECT_EQ(host->UnloadModule(path), TOV_OK);
    EXPECT_EQ(host.Texts().back(), "Test Module Unloaded");
    EXPECT_TRUE(host->LoadedPlugins().empty());
    void* out = nullptr;
    EXPECT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, &out), ZEB_E_NOTFOUND);
    EXPECT_EQ(host->UnloadModule(path), ZEB_E_NOTFOUND);
}

TEST_F(ModuleLoading, AModuleCanBeLoadedAgainAfterUnloading) {
    const std::string path = ModulePath("full");
    ASSERT_EQ(host->LoadModule(path, error), TOV_OK) << error;
    ASSERT_EQ(host->UnloadModule(path), TOV_OK);
    ASSERT_EQ(host->LoadModule(path, error), TOV_OK) << error;
}

TEST_F(ModuleLoading, TheSameComponentsCannotBeRegisteredTwice) {
    const std::string path = ModulePath("full");
    ASSERT_EQ(host->LoadModule(path, error), TOV_OK) << error;
    EXPECT_EQ(host->LoadModule(path, error), ZEB_E_ALREADYSET);
    EXPECT_EQ(host->LoadedPlugins().size(), 1u);
    TOVPtr<ITestEcho> echo;
    ASSERT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, echo.Out()), TOV_OK)
        << "the first load stays usable";
    EXPECT_EQ(echo->Echo(0), 1);
}

struct LoadFailure {
    const char* variant;
    TOVRESULT expected;
    const char* says;
};

TEST_F(ModuleLoading, FailuresSayWhatWentWrong) {
    const LoadFailure cases[] = {
        {"missing", TOV_E_FILEOPEN, "cannot load module"},
        {"noshutdown", ZEB_E_NOTFOUND, "does not export TOVShutdown"},
        {"failstartup", TOV_E_FAIL, "failed to start"},
    };
    for (const LoadFailure& c : cases) {
        error.clear();
        const std::string path = ModulePath(c.variant);
        EXPECT_EQ(host->LoadModule(path, error), c.expected) << c.variant;
        EXPECT_NE(error.find(c.says), std::string::npos) << c.variant << ": " << error;
        EXPECT_NE(error.find(path), std::string::npos) << c.variant << ": " << error;
        EXPECT_TRUE(host->LoadedPlugins().empty()) << c.variant;
        void* out = nullptr;
        EXPECT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, &out), ZEB_E_NOTFOUND)
            << c.variant << ": nothing of a failed module stays registered";
    }
}

TEST_F(ModuleLoading, LoadingAFileThatIsNoModuleFails) {
    EXPECT_EQ(host->LoadModule("/etc/hostname", error), TOV_E_FILEOPEN);
    EXPECT_NE(error.find("/etc/hostname"), std::string::npos);
}

}  // namespace
