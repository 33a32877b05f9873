#pragma once
/// The steps that the single-file and the grouped clip take alike: Mob
/// identifiers and names, the timecode slots and the file's place on the
/// tape, descriptor locations, and the slots' lookups and padding.
#include <string>

#include "aaf/AAF.h"
#include "aafbuilder/CAAFBuiltinDefs.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"

namespace ZEB {
namespace Impl {

/// The Source Mobs differ from the Master Mob's identity in byte 13, the
/// instance number's high byte: a grouped clip's i-th file Mob has 0xB1 + i.
inline constexpr aafUInt8 kFileMobInstance = 0xB1;
inline constexpr aafUInt8 kTapeMobInstance = 0xA1;

/// A file descriptor's media access kind: the host reads the samples itself,
/// through the sample map.
inline constexpr unsigned int kMediaAccessKind = 3;

aafMobID_t WithInstanceHigh(aafMobID_t id, aafUInt8 value);

/// Names `mob` with UTF-8 text; a refusal throws its result.
void SetMobName(IAAFMob* mob, const std::string& utf8);

/// A timecode slot on `tape` for each timecode track of the Movie; a slot
/// that cannot be made is left out. Returns the number of timecode tracks.
int AddTimecodeSlots(const OrloReader::Movie& movie, const aafRational_t& tapeRate, IAAFDictionary* dictionary,
                     IAAFMob* tape);

/// Where the file starts on the tape, in edit units of `movieRate`.
long long StartOffset(const OrloReader::Movie& movie, const aafRational_t& movieRate, const aafRational_t& tapeRate);

/// A network locator with the URL of `path`, and the plug-in's container GUID.
void AddDescriptorLocation(const ZEBString& path, IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor);

IAAFSmartPointer<IAAFMobSlot> LookupSlot(IAAFMob* mob, aafSlotID_t id);

/// A tape slot's length: `length`, with 48 hours of edit units added when it
/// is shorter than that.
aafLength_t TapeLength(aafLength_t length, const aafRational_t& editRate);

}  // namespace Impl
}  // namespace ZEB
