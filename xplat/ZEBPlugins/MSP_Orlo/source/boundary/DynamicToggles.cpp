#include "boundary/DynamicToggles.h"

#include "boundary/OrloConstants.h"
#include "tov/IFTFManager.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

/// A new manager from `factory`; a failed creation is thrown as its result.
TOVPtr<IFTFManager> CreateManager(ITOVComponentFactory* factory) {
    TOVPtr<IFTFManager> manager;
    TOVCheck(factory->CreateComponent(TOVCompID_FTFManager, nullptr, IID_IFTFManager, manager.Out()));
    return manager;
}

/// The common form of reading and setting: runs `access` on a new manager
/// once `path` is known to be registered. Whatever the manager throws becomes
/// `whenThrown`.
template <class Access>
TOVRESULT WithRegisteredToggle(ITOVComponentFactory* factory, const std::string& path, TOVRESULT whenThrown,
                               Access&& access) {
    if (!factory) return TOV_E_NOINTERFACE;
    return TOVGuarded([&] {
        TOVPtr<IFTFManager> manager = CreateManager(factory);
        if (!manager) return TOV_E_UNEXPECTED;
        try {
            if (!manager->IsToggleRegistered(path.c_str())) return ZEB_E_NOTFOUND;
            return access(*manager);
        } catch (...) {
            return whenThrown;
        }
    });
}

}  // namespace

void RegisterDynamicToggles(TOVPtr<ITOVComponentFactory>& factory) {
    if (!factory) return;
    // The order of registration is the host's order of listing.
    const char* const paths[] = {toggle_MobIDFromiXML, toggle_StartTimeCodeFromFileCreationTime,
                                 toggle_IgnoreHostSettingsForUnitTest, toggle_StartTimeCodeFromBEXTOriginationDate,
                                 toggle_BigEndianSmpteIdInBEXTData};
    TOVPtr<IFTFManager> manager = CreateManager(factory.Get());
    if (!manager) return;
    for (const char* path : paths) {
        if (!manager->IsToggleRegistered(path)) TOVCheck(manager->RegisterToggle(path, 0, kOrloFeatureGroup));
    }
}

TOVRESULT RetrieveDynamicToggleValue(ITOVComponentFactory* factory, const std::string& path, unsigned int* value) {
    return WithRegisteredToggle(factory, path, ZEB_E_NOTFOUND,
                                [&](IFTFManager& manager) { return manager.GetToggleValue(path.c_str(), value); });
}

TOVRESULT SetDynamicToggleValue(TOVPtr<ITOVComponentFactory>& factory, const std::string& path, unsigned int value) {
    return WithRegisteredToggle(factory.Get(), path, TOV_E_UNEXPECTED,
                                [&](IFTFManager& manager) { return manager.SetToggleValue(path.c_str(), value); });
}

}  // namespace Impl
}  // namespace ZEB
