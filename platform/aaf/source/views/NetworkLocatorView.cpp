#include "NetworkLocatorView.h"

#include "../core/Guard.h"

namespace aafmodel {

AAFRESULT NetworkLocatorView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
