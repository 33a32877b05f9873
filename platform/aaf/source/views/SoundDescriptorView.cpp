#include "SoundDescriptorView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

namespace {
using P = BuiltinDefinitions::Properties;
}  // namespace

AAFRESULT SoundDescriptorView::SetCompression(aafUID_constref compression) {
    return SetBuiltin(m_object, &P::soundCompression, compression);
}
AAFRESULT SoundDescriptorView::GetCompression(aafUID_t* pCompression) {
    return GetBuiltin(m_object, &P::soundCompression, pCompression);
}
AAFRESULT SoundDescriptorView::SetChannelCount(aafUInt32 channelCount) {
    return SetBuiltin(m_object, &P::soundChannels, channelCount);
}
AAFRESULT SoundDescriptorView::GetChannelCount(aafUInt32* pChannelCount) {
    return GetBuiltin(m_object, &P::soundChannels, pChannelCount);
}
AAFRESULT SoundDescriptorView::SetAudioSamplingRate(aafRational_t rate) {
    return SetBuiltin(m_object, &P::soundAudioSamplingRate, rate);
}
AAFRESULT SoundDescriptorView::GetAudioSamplingRate(aafRational_t* pRate) {
    return GetBuiltin(m_object, &P::soundAudioSamplingRate, pRate);
}
AAFRESULT SoundDescriptorView::SetIsLocked(aafBoolean_t locked) {
    return SetBuiltin(m_object, &P::soundLocked, locked ? kAAFTrue : kAAFFalse);
}
AAFRESULT SoundDescriptorView::IsLocked(aafBoolean_t* pLocked) {
    return GetBuiltin(m_object, &P::soundLocked, pLocked);
}
AAFRESULT SoundDescriptorView::SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) {
    return SetBuiltin(m_object, &P::soundElectroSpatial, formulation);
}
AAFRESULT SoundDescriptorView::GetElectroSpatialFormulation(aafElectroSpatialFormulation_t* pFormulation) {
    return GetBuiltin(m_object, &P::soundElectroSpatial, pFormulation);
}
// Reference level and dialogue normalisation are not kept by this library.
AAFRESULT SoundDescriptorView::SetAudioRefLevel(aafInt8) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::GetAudioRefLevel(aafInt8*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::SetDialNorm(aafInt8) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::GetDialNorm(aafInt8*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::SetQuantizationBits(aafUInt32 bitsCount) {
    return SetBuiltin(m_object, &P::soundQuantizationBits, bitsCount);
}
AAFRESULT SoundDescriptorView::GetQuantizationBits(aafUInt32* pBitsCount) {
    return GetBuiltin(m_object, &P::soundQuantizationBits, pBitsCount);
}

}  // namespace aafmodel
