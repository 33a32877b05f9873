// The module's hold on the host's factory, and its release.
#include <gtest/gtest.h>

#include "TestHost.h"
#include "boundary/ModuleGlobals.h"

namespace {

using OrloReader::InitOrloReader;
using OrloReader::s_pComponentFactory;
using OrloReader::ShutdownOrloReader;

uint32_t References(ITOVUnknown* object) {
    object->AddRef();
    return object->Release();
}

class ModuleGlobals : public ::testing::Test {
protected:
    ~ModuleGlobals() override { ShutdownOrloReader(); }

    TestHost host;
};

TEST_F(ModuleGlobals, KeepOneReferenceToTheFirstHostsFactoryUntilShutdown) {
    const uint32_t before = References(host->AsUnknown());
    InitOrloReader(host->AsUnknown());
    ASSERT_EQ(s_pComponentFactory, static_cast<ITOVComponentFactory*>(host.Get()));
    EXPECT_EQ(References(host->AsUnknown()), before + 1);

    TestHost second;
    InitOrloReader(second->AsUnknown());  // one kept already: nothing changes
    EXPECT_EQ(s_pComponentFactory, static_cast<ITOVComponentFactory*>(host.Get()));
    EXPECT_EQ(References(host->AsUnknown()), before + 1);

    ShutdownOrloReader();
    EXPECT_EQ(s_pComponentFactory, nullptr);
    EXPECT_EQ(References(host->AsUnknown()), before);
    ShutdownOrloReader();  // twice is harmless
    EXPECT_EQ(References(host->AsUnknown()), before);
}

TEST_F(ModuleGlobals, AHostWithoutAFactoryIsThrown) {
    TOVPtr<ITOVUnknown> notAHost;
    ASSERT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, IID_ITOVUnknown, notAHost.Out()), TOV_OK);
    struct Case {
        ITOVUnknown* host;
        TOVRESULT thrown;
    };
    for (const Case& c : {Case{notAHost.Get(), TOV_E_NOINTERFACE}, Case{nullptr, TOV_E_POINTER}}) {
        try {
            InitOrloReader(c.host);
            ADD_FAILURE() << "no factory must be thrown";
        } catch (int result) {
            EXPECT_EQ(result, c.thrown);
        }
        EXPECT_EQ(s_pComponentFactory, nullptr);
    }
}

}  // namespace
