#include "PCMDescriptorView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

// The mandatory properties start at zero until the caller sets them.
AAFRESULT PCMDescriptorView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.SetFixed(*b.p.pcmBlockAlign, aafUInt16{0});
        m_object.SetFixed(*b.p.pcmAverageBPS, aafUInt32{0});
        m_object.SetFixed(*b.p.soundAudioSamplingRate, aafRational_t{0, 1});
        m_object.SetFixed(*b.p.soundChannels, aafUInt32{0});
        m_object.SetFixed(*b.p.soundQuantizationBits, aafUInt32{0});
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT PCMDescriptorView::SetBlockAlign(aafUInt16 blockAlign) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.pcmBlockAlign, blockAlign);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT PCMDescriptorView::GetBlockAlign(aafUInt16* pBlockAlign) {
    return Guarded([&] {
        Require(pBlockAlign);
        *pBlockAlign = m_object.GetRequired<aafUInt16>(*Builtins(m_object).p.pcmBlockAlign);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT PCMDescriptorView::SetSequenceOffset(aafUInt8) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT PCMDescriptorView::GetSequenceOffset(aafUInt8*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT PCMDescriptorView::SetAverageBPS(aafUInt32 bps) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.pcmAverageBPS, bps);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT PCMDescriptorView::GetAverageBPS(aafUInt32* pBps) {
    return Guarded([&] {
        Require(pBps);
        *pBps = m_object.GetRequired<aafUInt32>(*Builtins(m_object).p.pcmAverageBPS);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
