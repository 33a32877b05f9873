#include "FillerView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

// Any length is kept as given, a negative one too: the caller decides.
AAFRESULT FillerView::Initialize(IAAFDataDef* pDataDef, aafLength_t length) {
    return Guarded([&] {
        DataDefinition& def = DataDefArg(pDataDef);
        m_object.MarkInitialized();
        SetDataDefinition(m_object, def);
        m_object.SetFixed(*Builtins(m_object).p.componentLength, length);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
