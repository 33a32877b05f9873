#pragma once
/// The essence descriptor of one audio media: what its samples are, as a PCM
/// descriptor. Both forms return 0 or a result code and never throw.
#include <memory>

#include "aaf/AAF.h"
#include "clipmodel/Media.h"
#include "clipmodel/Movie.h"
#include "tov/TOVResult.h"

namespace ZEB {
namespace Impl {

/// Fills `descriptor`, which the caller has initialised. ZEB_E_NOSOUNDDESCRIPTOR
/// for media without a sound descriptor (or no media at all), ZEB_E_AAFCREATE
/// for a format other than PCM. A failure part way leaves what was set.
TOVRESULT AddAudioDescriptor(IAAFPCMDescriptor* descriptor, std::shared_ptr<OrloReader::Media> media);

/// Makes a new PCM descriptor of `media` and appends it to `multiple`; the
/// first one appended gives `multiple` its sample rate. `movie` is not used.
/// TOV_E_POINTER for a null `multiple`.
TOVRESULT AddAudioDescriptor(OrloReader::Movie* movie, IAAFDictionary* dictionary, IAAFMultipleDescriptor* multiple,
                             std::shared_ptr<OrloReader::Media> media);

}  // namespace Impl
}  // namespace ZEB
