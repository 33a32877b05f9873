// Registering, reading and setting the plug-in's toggles, on a real host and
// on stand-ins that fail where a host could.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "BoundaryMocks.h"
#include "TestHost.h"
#include "boundary/DynamicToggles.h"
#include "boundary/OrloConstants.h"
#include "tov/host/HostText.h"

namespace {

using ::testing::_;
using ::testing::NiceMock;
using ::testing::Return;
using ZEB::Impl::RegisterDynamicToggles;
using ZEB::Impl::RetrieveDynamicToggleValue;
using ZEB::Impl::SetDynamicToggleValue;

// Registered twice, with a value set in between: the five stay in their order
// and group, off but for the one set.
TEST(DynamicToggles, RegisterOffInOrderAndGroupKeepingValuesAlreadyThere) {
    TestHost host;
    TOVPtr<ITOVComponentFactory> factory;
    factory.Assign(host.Get());
    TOVPtr<IFTFManager> manager;
    ASSERT_EQ(host->CreateComponent(TOVCompID_FTFManager, nullptr, IID_IFTFManager, manager.Out()), TOV_OK);
    RegisterDynamicToggles(factory);
    ASSERT_EQ(SetDynamicToggleValue(factory, toggle_StartTimeCodeFromBEXTOriginationDate, 1), TOV_OK);
    RegisterDynamicToggles(factory);
    const std::pair<std::string, unsigned int> expected[] = {
        {"/OrloReaderMovMediaContainer/MobIDFromiXML", 0},
        {"/OrloReaderMovMediaContainer/StartTimeCodeFromFileCreationTime", 0},
        {"/OrloReaderMovMediaContainer/IgnoreHostSettingsForUnitTest", 0},
        {"/OrloReaderMovMediaContainer/AudioTimecodeUseBEXTOriginationDate", 1},
        {"/OrloReaderMovMediaContainer/BigEndianSmpteIdInBEXTData", 0},
    };
    uint32_t count = 0;
    ASSERT_EQ(manager->GetToggleCount(&count), TOV_OK);
    ASSERT_EQ(count, 5u);
    for (uint32_t index = 0; index < count; ++index) {
        ITOVString* path = nullptr;
        ASSERT_EQ(manager->GetTogglePath(index, &path), TOV_OK);
        TOVPtr<ITOVString> ownedPath(path);
        const std::string text = HostText::Read(path);
        EXPECT_EQ(text, expected[index].first);
        ITOVString* group = nullptr;
        ASSERT_EQ(manager->GetToggleGroup(text.c_str(), &group), TOV_OK);
        TOVPtr<ITOVString> ownedGroup(group);
        EXPECT_EQ(HostText::Read(group), "orrin.released.features");
        unsigned int value = 9;
        EXPECT_EQ(RetrieveDynamicToggleValue(factory.Get(), text, &value), TOV_OK);
        EXPECT_EQ(value, expected[index].second) << text;
    }
}

TEST(DynamicToggles, NoFactoryIsNoInterfaceAndRegistersNothing) {
    TOVPtr<ITOVComponentFactory> none;
    EXPECT_NO_THROW(RegisterDynamicToggles(none));
    unsigned int value = 0;
    EXPECT_EQ(RetrieveDynamicToggleValue(nullptr, toggle_MobIDFromiXML, &value), TOV_E_NOINTERFACE);
    EXPECT_EQ(SetDynamicToggleValue(none, toggle_MobIDFromiXML, 1), TOV_E_NOINTERFACE);
}

// A manager stand-in behind a factory stand-in, every slot succeeding.
struct StandIns {
    StandIns() {
        ON_CALL(factory, CreateComponent(TOVCompID_FTFManager, nullptr, IID_IFTFManager, _))
            .WillByDefault(HandOut<IFTFManager>(&manager));
        ON_CALL(manager, IsToggleRegistered(_)).WillByDefault(Return(1));
        ON_CALL(manager, GetToggleValue(_, _)).WillByDefault(Return(TOV_OK));
        ON_CALL(manager, SetToggleValue(_, _)).WillByDefault(Return(TOV_OK));
        ON_CALL(manager, RegisterToggle(_, _, _)).WillByDefault(Return(TOV_OK));
        held.Assign(&factory);
    }

    NiceMock<MockFactory> factory;
    NiceMock<MockManager> manager;
    TOVPtr<ITOVComponentFactory> held;
};

// What `call` threw as a result, or TOV_OK when it threw nothing.
TOVRESULT Thrown(const std::function<void()>& call) {
    try {
        call();
    } catch (int result) {
        return result;
    }
    return TOV_OK;
}

struct AccessCase {
    const char* name;
    std::function<void(MockFactory&, MockManager&)> arrange;
    TOVRESULT read, set;
};

const AccessCase kAccessCases[] = {
    {"factory fails",
     [](MockFactory& f, MockManager&) {
         ON_CALL(f, CreateComponent(_, _, _, _)).WillByDefault(FailCreation(CLASS_E_CLASSNOTAVAILABLE));
     },
     CLASS_E_CLASSNOTAVAILABLE, CLASS_E_CLASSNOTAVAILABLE},
    {"factory gives no manager",
     [](MockFactory& f, MockManager&) { ON_CALL(f, CreateComponent(_, _, _, _)).WillByDefault(FailCreation(TOV_OK)); },
     TOV_E_UNEXPECTED, TOV_E_UNEXPECTED},
    {"not registered", [](MockFactory&, MockManager& m) { ON_CALL(m, IsToggleRegistered(_)).WillByDefault(Return(0)); },
     ZEB_E_NOTFOUND, ZEB_E_NOTFOUND},
    {"registration check throws",
     [](MockFactory&, MockManager& m) {
         ON_CALL(m, IsToggleRegistered(_)).WillByDefault(::testing::Throw(std::runtime_error("lost")));
     },
     ZEB_E_NOTFOUND, TOV_E_UNEXPECTED},
    {"access throws a result",
     [](MockFactory&, MockManager& m) {
         ON_CALL(m, GetToggleValue(_, _)).WillByDefault(::testing::Throw(static_cast<int>(TOV_E_FAIL)));
         ON_CALL(m, SetToggleValue(_, _)).WillByDefault(::testing::Throw(static_cast<int>(TOV_E_FAIL)));
     },
     ZEB_E_NOTFOUND, TOV_E_UNEXPECTED},
    {"access fails",
     [](MockFactory&, MockManager& m) {
         ON_CALL(m, GetToggleValue(_, _)).WillByDefault(Return(TOV_E_OUTOFRANGE));
         ON_CALL(m, SetToggleValue(_, _)).WillByDefault(Return(TOV_E_OUTOFRANGE));
     },
     TOV_E_OUTOFRANGE, TOV_E_OUTOFRANGE},
};

TEST(DynamicToggles, ReadAndSetReportEachFailureAsTheirOwn) {
    for (const AccessCase& c : kAccessCases) {
        SCOPED_TRACE(c.name);
        StandIns s;
        c.arrange(s.factory, s.manager);
        unsigned int value = 0;
        EXPECT_EQ(RetrieveDynamicToggleValue(&s.factory, toggle_MobIDFromiXML, &value), c.read);
        EXPECT_EQ(value, 0u);
        EXPECT_EQ(SetDynamicToggleValue(s.held, toggle_MobIDFromiXML, 1), c.set);
    }
}

TEST(DynamicToggles, RegistrationThrowsTheFactorysFailureAndSkipsAMissingManager) {
    StandIns failing;
    ON_CALL(failing.factory, CreateComponent(_, _, _, _)).WillByDefault(FailCreation(ZEB_E_NOTFOUND));
    EXPECT_EQ(Thrown([&] { RegisterDynamicToggles(failing.held); }), ZEB_E_NOTFOUND);

    StandIns none;
    ON_CALL(none.factory, CreateComponent(_, _, _, _)).WillByDefault(FailCreation(TOV_OK));
    EXPECT_CALL(none.manager, RegisterToggle(_, _, _)).Times(0);
    EXPECT_EQ(Thrown([&] { RegisterDynamicToggles(none.held); }), TOV_OK);
}

TEST(DynamicToggles, RegistrationSkipsRegisteredTogglesAndThrowsTheFirstFailure) {
    StandIns s;
    ON_CALL(s.manager, IsToggleRegistered(_)).WillByDefault(Return(0));
    ON_CALL(s.manager, IsToggleRegistered(::testing::StrEq(toggle_MobIDFromiXML))).WillByDefault(Return(1));
    {
        ::testing::InSequence order;
        EXPECT_CALL(s.manager, RegisterToggle(::testing::StrEq(toggle_StartTimeCodeFromFileCreationTime), 0u,
                                              ::testing::StrEq(kOrloFeatureGroup)))
            .WillOnce(Return(TOV_OK));
        EXPECT_CALL(s.manager, RegisterToggle(::testing::StrEq(toggle_IgnoreHostSettingsForUnitTest), 0u, _))
            .WillOnce(Return(TOV_E_OUTOFMEMORY));
    }
    EXPECT_EQ(Thrown([&] { RegisterDynamicToggles(s.held); }), TOV_E_OUTOFMEMORY);
}

}  // namespace
