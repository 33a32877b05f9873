#pragma once
/// Describes sound essence.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFSoundDescriptor : public IUnknown {
public:
    virtual AAFRESULT SetCompression(aafUID_constref compression) = 0;
    virtual AAFRESULT GetCompression(aafUID_t* pCompression) = 0;
    virtual AAFRESULT SetChannelCount(aafUInt32 channelCount) = 0;
    virtual AAFRESULT GetChannelCount(aafUInt32* pChannelCount) = 0;
    virtual AAFRESULT SetAudioSamplingRate(aafRational_t rate) = 0;
    virtual AAFRESULT GetAudioSamplingRate(aafRational_t* pRate) = 0;
    virtual AAFRESULT SetIsLocked(aafBoolean_t locked) = 0;
    virtual AAFRESULT IsLocked(aafBoolean_t* pLocked) = 0;
    virtual AAFRESULT SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) = 0;
    virtual AAFRESULT GetElectroSpatialFormulation(aafElectroSpatialFormulation_t* pFormulation) = 0;
    virtual AAFRESULT SetAudioRefLevel(aafInt8 level) = 0;
    virtual AAFRESULT GetAudioRefLevel(aafInt8* pLevel) = 0;
    virtual AAFRESULT SetDialNorm(aafInt8 dialNorm) = 0;
    virtual AAFRESULT GetDialNorm(aafInt8* pDialNorm) = 0;
    virtual AAFRESULT SetQuantizationBits(aafUInt32 bitsCount) = 0;
    virtual AAFRESULT GetQuantizationBits(aafUInt32* pBitsCount) = 0;

protected:
    ~IAAFSoundDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFSoundDescriptor);
