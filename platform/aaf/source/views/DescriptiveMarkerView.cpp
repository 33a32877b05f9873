#include "DescriptiveMarkerView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

// A new marker stands at position 0 until SetPosition moves it.
AAFRESULT DescriptiveMarkerView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        m_object.SetFixed(*Builtins(m_object).p.eventPosition, aafPosition_t{0});
        return AAFRESULT_SUCCESS;
    });
}

// Described slots and descriptive frameworks are not kept by this library.
AAFRESULT DescriptiveMarkerView::SetDescribedSlotIDs(aafUInt32, aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DescriptiveMarkerView::GetDescribedSlotIDs(aafUInt32, aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DescriptiveMarkerView::GetDescribedSlotIDsSize(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DescriptiveMarkerView::SetDescription(IUnknown*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT DescriptiveMarkerView::GetDescription(IUnknown**) { return AAFRESULT_NOT_IMPLEMENTED; }

}  // namespace aafmodel
