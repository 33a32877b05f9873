#pragma once
/// The plug-in's dynamic toggles in the host's feature-toggle manager. Each
/// call makes a manager of its own: the toggles belong to the host, and a
/// change there counts from the next read on.
#include <string>

#include "tov/ITOVComponentFactory.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace Impl {

/// Registers the five toggles with the value 0 in the plug-in's feature group;
/// a toggle already registered keeps its value. Does nothing for an empty
/// factory or when no manager comes back. Throws a failing result as an `int`,
/// so that it ends the start-up.
void RegisterDynamicToggles(TOVPtr<ITOVComponentFactory>& factory);

/// Reads the toggle at `path` into `*value`. TOV_E_NOINTERFACE for a null
/// factory, the creation's result when no manager can be made,
/// TOV_E_UNEXPECTED when none comes back, ZEB_E_NOTFOUND for a toggle not
/// registered or a manager that throws. Callers preset `*value` to 0, so that
/// a toggle that cannot be read counts as off.
TOVRESULT RetrieveDynamicToggleValue(ITOVComponentFactory* factory, const std::string& path, unsigned int* value);

/// Sets the toggle at `path`. Results as for reading, except that a manager
/// that throws gives TOV_E_UNEXPECTED.
TOVRESULT SetDynamicToggleValue(TOVPtr<ITOVComponentFactory>& factory, const std::string& path, unsigned int value);

}  // namespace Impl
}  // namespace ZEB
