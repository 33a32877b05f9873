// Start-up and shutdown of the utility library against the reference host.
#include <gtest/gtest.h>

#include "TestHost.h"
#include "startup/ZEBUtilLib.h"

namespace {

using namespace ZEB;
using namespace ZEB::ZEBUtilLib;

// A factory that passes everything to a real host but one step, which fails.
class FaultyFactory : public ITOVComponentFactory {
public:
    enum class Fault { ClassFactory, Definition, Console };
    FaultyFactory(TOVHost* real, Fault fault) : m_Real(real), m_Fault(fault) {}

    TOVRESULT QueryInterface(const _tovUID& iid, void** out) override {
        if (m_Fault == Fault::Console && iid == IID_ITOVConsole) return TOV_E_NOINTERFACE;
        return m_Real->QueryInterface(iid, out);
    }
    uint32_t AddRef() override { return ++refs; }
    uint32_t Release() override { return --refs; }
    TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out) override {
        return m_Real->CreateComponent(compID, outer, iid, out);
    }
    TOVRESULT GetClassFactory(const _tovUID& clsid, const _tovUID& iid, void** out) override {
        if (m_Fault == Fault::ClassFactory) return TOV_E_FAIL;
        return m_Real->GetClassFactory(clsid, iid, out);
    }
    TOVRESULT GetComponentDefinition(const _tovUID& compID, const _tovUID& iid, void** out) override {
        if (m_Fault == Fault::Definition) {
            *out = nullptr;
            return TOV_OK;  // success without an object
        }
        return m_Real->GetComponentDefinition(compID, iid, out);
    }
    uint32_t refs = 1;

private:
    TOVHost* m_Real;
    Fault m_Fault;
};

class LibraryStartup : public ::testing::Test {
protected:
    void TearDown() override {
        while (gZEBRef) ZEBTerminate();
    }
    void ExpectStopped() {
        EXPECT_EQ(gZEBRef, 0u);
        EXPECT_EQ(gpComponentFactory, nullptr);
        EXPECT_EQ(gpClassFactory, nullptr);
        EXPECT_EQ(gpConsole, nullptr);
    }
    TestHost host;
};

TEST_F(LibraryStartup, StartsOnceSaysSoAndStopsAfterAsManyStops) {
    EXPECT_EQ(ZEBTerminate(), TOV_OK) << "a stop without a start does nothing";
    ExpectStopped();
    ASSERT_EQ(ZEBInitialize(host.Get()), TOV_OK);
    EXPECT_NE(gpComponentFactory, nullptr);
    EXPECT_EQ(host.Lines(), (std::vector<std::pair<uint32_t, std::string>>{{16u, "ZEBUtilLib initialized"}}));
    EXPECT_EQ(ZEBInitialize(host.Get(), nullptr), ZEB_E_ALREADYSET);
    EXPECT_EQ(gZEBRef, 2u);
    EXPECT_EQ(ZEBTerminate(), TOV_OK);
    EXPECT_NE(gpClassFactory, nullptr) << "still usable after the first stop";
    ZEBTerminate();
    ExpectStopped();
}

TEST_F(LibraryStartup, AFailedStartLeavesNothingAndCanBeRetried) {
    const struct {
        FaultyFactory::Fault fault;
        TOVRESULT expected;
    } cases[] = {{FaultyFactory::Fault::ClassFactory, TOV_E_FAIL},
                 {FaultyFactory::Fault::Definition, TOV_E_POINTER},
                 {FaultyFactory::Fault::Console, TOV_E_NOINTERFACE}};
    for (const auto& c : cases) {
        FaultyFactory faulty(host.Get(), c.fault);
        EXPECT_EQ(ZEBInitialize(&faulty), c.expected);
        ExpectStopped();
        EXPECT_EQ(faulty.refs, 1u) << "the factory's reference was given back";
    }
    EXPECT_EQ(ZEBInitialize(nullptr), TOV_E_POINTER);
    ExpectStopped();
    EXPECT_EQ(ZEBInitialize(host.Get()), TOV_OK);
}

}  // namespace
