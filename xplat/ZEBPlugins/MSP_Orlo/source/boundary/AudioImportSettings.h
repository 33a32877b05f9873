#pragma once
/// The one host setting the plug-in reads: whether monophonic Broadcast Wave
/// files of one recording are grouped into one clip.
#include "tov/IHostSettings.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace Impl {

/// Sets `autodetect` from the host's grouping setting. Unless the toggle
/// toggle_IgnoreHostSettingsForUnitTest is on, `settings` is replaced by a new
/// host settings object (left empty when none can be made); with it on, a
/// settings object the caller put in `settings` is asked all the same. An
/// empty `settings`, a null factory, or a setting that cannot be read leave
/// `autodetect` as the caller set it. `settings` stays filled for the caller.
/// Returns 0; what a settings object throws comes back as the failure
/// style's result, and `autodetect` stays.
TOVRESULT GetAudioImportSettings(ITOVComponentFactory* factory, TOVPtr<IHostSettings>& settings, bool& autodetect);

}  // namespace Impl
}  // namespace ZEB
