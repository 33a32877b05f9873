#include "ImportDescriptorView.h"

#include "../core/Guard.h"

namespace aafmodel {

AAFRESULT ImportDescriptorView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
