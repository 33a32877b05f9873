#include "SoundDescriptorView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

namespace {
template <class T>
AAFRESULT Put(ModelObject& object, PropertyDefinition* BuiltinDefinitions::Properties::*prop, const T& v) {
    return Guarded([&] {
        object.SetFixed(*(Builtins(object).p.*prop), v);
        return AAFRESULT_SUCCESS;
    });
}
template <class T>
AAFRESULT Take(ModelObject& object, PropertyDefinition* BuiltinDefinitions::Properties::*prop, T* out) {
    return Guarded([&] {
        Require(out);
        *out = object.GetRequired<T>(*(Builtins(object).p.*prop));
        return AAFRESULT_SUCCESS;
    });
}
using P = BuiltinDefinitions::Properties;
}  // namespace

AAFRESULT SoundDescriptorView::SetCompression(aafUID_constref compression) {
    return Put(m_object, &P::soundCompression, compression);
}
AAFRESULT SoundDescriptorView::GetCompression(aafUID_t* pCompression) {
    return Take(m_object, &P::soundCompression, pCompression);
}
AAFRESULT SoundDescriptorView::SetChannelCount(aafUInt32 channelCount) {
    return Put(m_object, &P::soundChannels, channelCount);
}
AAFRESULT SoundDescriptorView::GetChannelCount(aafUInt32* pChannelCount) {
    return Take(m_object, &P::soundChannels, pChannelCount);
}
AAFRESULT SoundDescriptorView::SetAudioSamplingRate(aafRational_t rate) {
    return Put(m_object, &P::soundAudioSamplingRate, rate);
}
AAFRESULT SoundDescriptorView::GetAudioSamplingRate(aafRational_t* pRate) {
    return Take(m_object, &P::soundAudioSamplingRate, pRate);
}
AAFRESULT SoundDescriptorView::SetIsLocked(aafBoolean_t locked) {
    return Put(m_object, &P::soundLocked, locked ? kAAFTrue : kAAFFalse);
}
AAFRESULT SoundDescriptorView::IsLocked(aafBoolean_t* pLocked) { return Take(m_object, &P::soundLocked, pLocked); }
AAFRESULT SoundDescriptorView::SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) {
    return Put(m_object, &P::soundElectroSpatial, formulation);
}
AAFRESULT SoundDescriptorView::GetElectroSpatialFormulation(aafElectroSpatialFormulation_t* pFormulation) {
    return Take(m_object, &P::soundElectroSpatial, pFormulation);
}
// Reference level and dialogue normalisation are not kept by this library.
AAFRESULT SoundDescriptorView::SetAudioRefLevel(aafInt8) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::GetAudioRefLevel(aafInt8*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::SetDialNorm(aafInt8) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::GetDialNorm(aafInt8*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT SoundDescriptorView::SetQuantizationBits(aafUInt32 bitsCount) {
    return Put(m_object, &P::soundQuantizationBits, bitsCount);
}
AAFRESULT SoundDescriptorView::GetQuantizationBits(aafUInt32* pBitsCount) {
    return Take(m_object, &P::soundQuantizationBits, pBitsCount);
}

}  // namespace aafmodel
