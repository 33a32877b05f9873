#include "aafbuilder/CAAFBuiltinDefs.h"

namespace {

// The text of the failed assertion on the lookup's result.
constexpr const char* kLookupFailed = "AAFRESULT_SUCCEEDED (hr)";

}  // namespace

IAAFClassDef* CAAFBuiltinDefs::Class(IAAFSmartPointer<IAAFClassDef>& held, const aafUID_t& id) {
    if (held.IsNull() && AAFRESULT_FAILED(m_Dictionary->LookupClassDef(id, &held))) throw kLookupFailed;
    return held;
}

IAAFDataDef* CAAFBuiltinDefs::ddkAAFTimecode() {
    if (m_TimecodeDef.IsNull() && AAFRESULT_FAILED(m_Dictionary->LookupDataDef(kAAFDataDef_Timecode, &m_TimecodeDef)))
        throw kLookupFailed;
    return m_TimecodeDef;
}
