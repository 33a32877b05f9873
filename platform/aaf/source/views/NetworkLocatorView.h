#pragma once
/// A network locator.
#include "../core/ViewBase.h"
#include "aaf/IAAFNetworkLocator.h"

namespace aafmodel {

class NetworkLocatorView final : public View<IAAFNetworkLocator> {
public:
    using View::View;

    AAFRESULT Initialize() override;
};

}  // namespace aafmodel
