#pragma once
/// Stand-ins for the host's factory, toggle manager and settings, for the
/// failures a real host never shows: no manager, slots that fail or throw.
/// They live on the test's stack; their counts are not kept.
#include <gmock/gmock.h>

#include "tov/IFTFManager.h"
#include "tov/IHostSettings.h"
#include "tov/ITOVComponentFactory.h"

/// The three slots of ITOVUnknown, with counts that keep nothing.
#define BOUNDARY_MOCK_UNKNOWN                                                             \
    MOCK_METHOD(TOVRESULT, QueryInterface, (const _tovUID& iid, void** out), (override)); \
    uint32_t AddRef() override { return 1; }                                              \
    uint32_t Release() override { return 1; }

class MockFactory : public ITOVComponentFactory {
public:
    virtual ~MockFactory() = default;
    BOUNDARY_MOCK_UNKNOWN
    MOCK_METHOD(TOVRESULT, CreateComponent, (const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out),
                (override));
    MOCK_METHOD(TOVRESULT, GetClassFactory, (const _tovUID& clsid, const _tovUID& iid, void** out), (override));
    MOCK_METHOD(TOVRESULT, GetComponentDefinition, (const _tovUID& compID, const _tovUID& iid, void** out), (override));
};

class MockManager : public IFTFManager {
public:
    virtual ~MockManager() = default;
    BOUNDARY_MOCK_UNKNOWN
    MOCK_METHOD(TOVRESULT, GetToggleCount, (uint32_t * count), (override));
    MOCK_METHOD(TOVRESULT, GetTogglePath, (uint32_t index, ITOVString** path), (override));
    MOCK_METHOD(TOVRESULT, GetToggleGroup, (const char* path, ITOVString** group), (override));
    MOCK_METHOD(TOVRESULT, GetToggleDefault, (const char* path, uint32_t* value), (override));
    MOCK_METHOD(TOVRESULT, ResetToggle, (const char* path), (override));
    MOCK_METHOD(TOVRESULT, UnregisterToggle, (const char* path), (override));
    MOCK_METHOD(TOVRESULT, RegisterToggle, (const char* path, uint32_t defaultValue, const char* group), (override));
    MOCK_METHOD(TOVRESULT, GetToggleValue, (const char* path, uint32_t* value), (override));
    MOCK_METHOD(TOVRESULT, SetToggleValue, (const char* path, uint32_t value), (override));
    MOCK_METHOD(int32_t, IsToggleRegistered, (const char* path), (override));
};

class MockSettings : public IHostSettings {
public:
    virtual ~MockSettings() = default;
    BOUNDARY_MOCK_UNKNOWN
    MOCK_METHOD(TOVRESULT, SetSetting, (const _tovUID& setting, uint32_t size, uint32_t value), (override));
    MOCK_METHOD(TOVRESULT, GetSetting, (const _tovUID& setting, uint32_t size, uint32_t* value), (override));
};

#undef BOUNDARY_MOCK_UNKNOWN

/// A CreateComponent action that hands out `object` as the interface `I`.
template <class I>
auto HandOut(I* object) {
    return [object](const _tovUID&, ITOVUnknown*, const _tovUID&, void** out) {
        *out = object;
        return TOV_OK;
    };
}

/// A CreateComponent action that fails with `result` and hands out nothing.
inline auto FailCreation(TOVRESULT result) {
    return [result](const _tovUID&, ITOVUnknown*, const _tovUID&, void** out) {
        *out = nullptr;
        return result;
    };
}
