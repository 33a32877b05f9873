#pragma once
/// An import descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFImportDescriptor.h"

namespace aafmodel {

class ImportDescriptorView final : public View<IAAFImportDescriptor> {
public:
    using View::View;

    AAFRESULT Initialize() override;
};

}  // namespace aafmodel
