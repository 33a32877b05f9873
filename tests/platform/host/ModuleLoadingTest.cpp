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
    const std::string path = ModulePath("full");
};

TEST_F(ModuleLoading, LoadsCataloguesAndStartsAModuleOnce) {
    ASSERT_EQ(host->LoadModule(path, error), TOV_OK) << error;
    ASSERT_EQ(host->LoadedPlugins().size(), 1u);
    EXPECT_STREQ(host->LoadedPlugins()[0]->GetName(), L"Test Module");
    EXPECT_EQ(host.Texts(), std::vector<std::string>{"Test Module 2.3 Loaded"});

    EXPECT_EQ(host->LoadModule(path, error), ZEB_E_ALREADYSET) << "the same components cannot be registered twice";
    EXPECT_EQ(host->LoadedPlugins().size(), 1u);
    TOVPtr<ITestEcho> echo;
    ASSERT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, echo.Out()), TOV_OK);
    EXPECT_EQ(echo->Echo(41), 42);
}

TEST_F(ModuleLoading, UnloadWaitsForTheModulesObjectsAndAllowsALoadAgain) {
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
    EXPECT_EQ(host->LoadModule(path, error), TOV_OK) << error;
}

TEST_F(ModuleLoading, FailuresSayWhatWentWrong) {
    const struct {
        std::string path;
        TOVRESULT expected;
        const char* says;
    } cases[] = {
        {ModulePath("missing"), TOV_E_FILEOPEN, "cannot load module"},
        {"/etc/hostname", TOV_E_FILEOPEN, "cannot load module"},  // a file, but no module
        {ModulePath("noshutdown"), ZEB_E_NOTFOUND, "does not export TOVShutdown"},
        {ModulePath("failstartup"), TOV_E_FAIL, "failed to start"},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.path);
        error.clear();
        EXPECT_EQ(host->LoadModule(c.path, error), c.expected);
        EXPECT_NE(error.find(c.says), std::string::npos) << error;
        EXPECT_NE(error.find(c.path), std::string::npos) << error;
        EXPECT_TRUE(host->LoadedPlugins().empty());
        void* out = nullptr;
        EXPECT_EQ(host->CreateComponent(CompID_TestEcho, nullptr, IID_ITestEcho, &out), ZEB_E_NOTFOUND)
            << "nothing of a failed module stays registered";
    }
}

}  // namespace
