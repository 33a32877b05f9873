// The host's feature-toggle manager: one store per host, seen by every manager object of it.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "TestHost.h"
#include "tov/IFTFManager.h"
#include "tov/host/HostFTFManager.h"
#include "tov/host/HostText.h"

namespace {

constexpr const char* kPath = "/Area/Feature";
constexpr const char* kOther = "/Area/Other";

TOVPtr<IFTFManager> NewManager(TOVHost* host) {
    TOVPtr<IFTFManager> manager;
    EXPECT_EQ(host->CreateComponent(TOVCompID_FTFManager, nullptr, IID_IFTFManager, manager.Out()), TOV_OK);
    return manager;
}

std::string TextOf(ITOVString* text) {
    TOVPtr<ITOVString> owned(text);
    return HostText::Read(text);
}

uint32_t ValueOf(IFTFManager& manager, const char* path) {
    uint32_t value = 0xDEAD;
    EXPECT_EQ(manager.GetToggleValue(path, &value), TOV_OK);
    return value;
}

class HostToggles : public ::testing::Test {
protected:
    TestHost host;
    TOVPtr<IFTFManager> manager = NewManager(host.Get());
};

TEST_F(HostToggles, AreSharedByTheManagersOfOneHostOnlyAndOutliveIt) {
    ASSERT_EQ(manager->RegisterToggle(kPath, 0, "group"), TOV_OK);
    TOVPtr<IFTFManager> second = NewManager(host.Get());
    EXPECT_EQ(second->IsToggleRegistered(kPath), 1);
    ASSERT_EQ(second->SetToggleValue(kPath, 7), TOV_OK);
    EXPECT_EQ(ValueOf(*manager, kPath), 7u);

    TOVPtr<IFTFManager> elsewhere;
    {
        TestHost otherHost;
        elsewhere = NewManager(otherHost.Get());
        EXPECT_EQ(elsewhere->IsToggleRegistered(kPath), 0);
        ASSERT_EQ(elsewhere->RegisterToggle(kPath, 3, "group"), TOV_OK);
    }
    EXPECT_EQ(ValueOf(*elsewhere, kPath), 3u) << "a manager keeps the toggles of a host gone";
    EXPECT_EQ(ValueOf(*manager, kPath), 7u);
}

TEST_F(HostToggles, KeepTheFirstRegistrationUntilUnregistered) {
    ASSERT_EQ(manager->RegisterToggle(kPath, 4, "first"), TOV_OK);
    ASSERT_EQ(manager->SetToggleValue(kPath, 5), TOV_OK);
    EXPECT_EQ(manager->RegisterToggle(kPath, 9, "second"), ZEB_E_ALREADYSET);
    EXPECT_EQ(ValueOf(*manager, kPath), 5u);
    uint32_t defaultValue = 0;
    EXPECT_EQ(manager->GetToggleDefault(kPath, &defaultValue), TOV_OK);
    EXPECT_EQ(defaultValue, 4u);
    ITOVString* group = nullptr;
    ASSERT_EQ(manager->GetToggleGroup(kPath, &group), TOV_OK);
    EXPECT_EQ(TextOf(group), "first");

    ASSERT_EQ(manager->ResetToggle(kPath), TOV_OK);
    EXPECT_EQ(ValueOf(*manager, kPath), 4u);
    ASSERT_EQ(manager->SetToggleValue(kPath, 8), TOV_OK);
    ASSERT_EQ(manager->UnregisterToggle(kPath), TOV_OK);
    EXPECT_EQ(manager->IsToggleRegistered(kPath), 0);
    ASSERT_EQ(manager->RegisterToggle(kPath, 2, "g"), TOV_OK);
    EXPECT_EQ(ValueOf(*manager, kPath), 2u) << "unregistering forgets the value";
}

TEST_F(HostToggles, ListPathsInOrderOfRegistration) {
    for (const char* path : {kOther, kPath, ""}) ASSERT_EQ(manager->RegisterToggle(path, 0, "g"), TOV_OK);
    ASSERT_EQ(manager->UnregisterToggle(kOther), TOV_OK);
    ASSERT_EQ(manager->RegisterToggle(kOther, 0, "g"), TOV_OK);           // goes to the end
    EXPECT_EQ(manager->RegisterToggle(kPath, 0, "g"), ZEB_E_ALREADYSET);  // and a refused one nowhere

    uint32_t count = 0;
    ASSERT_EQ(manager->GetToggleCount(&count), TOV_OK);
    ASSERT_EQ(count, 3u);
    std::vector<std::string> paths;
    for (uint32_t index = 0; index < count; ++index) {
        ITOVString* path = nullptr;
        ASSERT_EQ(manager->GetTogglePath(index, &path), TOV_OK);
        paths.push_back(TextOf(path));
    }
    EXPECT_EQ(paths, (std::vector<std::string>{kPath, "", kOther}));
    ITOVString* past = reinterpret_cast<ITOVString*>(0x1);
    EXPECT_EQ(manager->GetTogglePath(count, &past), TOV_E_OUTOFRANGE);
    EXPECT_EQ(past, nullptr);
}

TEST_F(HostToggles, UnknownPathsAreNotFoundAndNullPathsOrPlacesInvalid) {
    ASSERT_EQ(manager->RegisterToggle(kOther, 0, "g"), TOV_OK);
    ITOVString* group = nullptr;
    uint32_t value = 0xDEAD;
    // Every slot that takes a path.
    const std::pair<const char*, std::function<TOVRESULT(const char*)>> slots[] = {
        {"GetToggleGroup", [&](const char* p) { return manager->GetToggleGroup(p, &group); }},
        {"GetToggleDefault", [&](const char* p) { return manager->GetToggleDefault(p, &value); }},
        {"GetToggleValue", [&](const char* p) { return manager->GetToggleValue(p, &value); }},
        {"SetToggleValue", [&](const char* p) { return manager->SetToggleValue(p, 1); }},
        {"ResetToggle", [&](const char* p) { return manager->ResetToggle(p); }},
        {"UnregisterToggle", [&](const char* p) { return manager->UnregisterToggle(p); }},
    };
    for (const auto& [name, call] : slots) {
        SCOPED_TRACE(name);
        EXPECT_EQ(call(kPath), ZEB_E_NOTFOUND);
        EXPECT_EQ(call("/area/other"), ZEB_E_NOTFOUND);  // paths keep their case
        EXPECT_EQ(call(nullptr), TOV_E_INVALIDARG);
    }
    EXPECT_EQ(group, nullptr);
    EXPECT_EQ(value, 0xDEADu);
    EXPECT_EQ(manager->IsToggleRegistered(nullptr), 0);
    EXPECT_EQ(ValueOf(*manager, kOther), 0u);  // nothing above touched the registered one

    EXPECT_EQ(manager->RegisterToggle(kPath, 0, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(manager->RegisterToggle(nullptr, 0, "g"), TOV_E_INVALIDARG);
    EXPECT_EQ(manager->IsToggleRegistered(kPath), 0);
    EXPECT_EQ(manager->GetToggleCount(nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(manager->GetTogglePath(0, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(manager->GetToggleGroup(kOther, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(manager->GetToggleDefault(kOther, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(manager->GetToggleValue(kOther, nullptr), TOV_E_INVALIDARG);
}

TEST_F(HostToggles, NeedAHostWithAStore) {
    TOVPtr<IFTFManager> made;
    EXPECT_EQ(HostFTFManager::TOVCreate(nullptr, nullptr, IID_IFTFManager, made.Out()), ZEB_E_NOTREADY);
    EXPECT_FALSE(made);
    // Any component other than the host: it has no stores to give.
    TOVPtr<ITOVUnknown> notAHost;
    ASSERT_EQ(host->CreateComponent(TOVCompID_TOVString, nullptr, IID_ITOVUnknown, notAHost.Out()), TOV_OK);
    EXPECT_EQ(HostFTFManager::TOVCreate(notAHost.Get(), nullptr, IID_IFTFManager, made.Out()), TOV_E_NOINTERFACE);
    EXPECT_FALSE(made);
}

}  // namespace
