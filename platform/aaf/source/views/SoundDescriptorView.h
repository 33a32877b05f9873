#pragma once
/// The properties of a sound descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFSoundDescriptor.h"

namespace aafmodel {

class SoundDescriptorView final : public View<IAAFSoundDescriptor> {
public:
    using View::View;

    AAFRESULT SetCompression(aafUID_constref compression) override;
    AAFRESULT GetCompression(aafUID_t* pCompression) override;
    AAFRESULT SetChannelCount(aafUInt32 channelCount) override;
    AAFRESULT GetChannelCount(aafUInt32* pChannelCount) override;
    AAFRESULT SetAudioSamplingRate(aafRational_t rate) override;
    AAFRESULT GetAudioSamplingRate(aafRational_t* pRate) override;
    AAFRESULT SetIsLocked(aafBoolean_t locked) override;
    AAFRESULT IsLocked(aafBoolean_t* pLocked) override;
    AAFRESULT SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) override;
    AAFRESULT GetElectroSpatialFormulation(aafElectroSpatialFormulation_t* pFormulation) override;
    AAFRESULT SetAudioRefLevel(aafInt8 level) override;
    AAFRESULT GetAudioRefLevel(aafInt8* pLevel) override;
    AAFRESULT SetDialNorm(aafInt8 dialNorm) override;
    AAFRESULT GetDialNorm(aafInt8* pDialNorm) override;
    AAFRESULT SetQuantizationBits(aafUInt32 bitsCount) override;
    AAFRESULT GetQuantizationBits(aafUInt32* pBitsCount) override;
};

}  // namespace aafmodel
