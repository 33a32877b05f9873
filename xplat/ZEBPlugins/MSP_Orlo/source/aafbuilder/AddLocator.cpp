#include "aafbuilder/AddLocator.h"

#include <string>

#include "aafbuilder/CAAFBuiltinDefs.h"
#include "strings/UTFConversions.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "volume/URLUtils.h"

namespace ZEB {
namespace Impl {

TOVRESULT AddLocator(const ZEBString& path, IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor) {
    return TOVGuarded([&] {
        CAAFBuiltinDefs defs(dictionary);
        ZEBString url;
        TOVCheck(MakeURLPathFromFilePath(path.InArg(), url.OutArg()));
        IAAFSmartPointer<IAAFNetworkLocator> network;
        TOVCheck(
            defs.cdNetworkLocator()->CreateInstance(IID_IAAFNetworkLocator, reinterpret_cast<IUnknown**>(&network)));
        IAAFSmartPointer<IAAFLocator> locator;
        TOVCheck(network->QueryInterface(IID_IAAFLocator, reinterpret_cast<void**>(&locator)));
        std::wstring wideURL;
        wFromUTF8(reinterpret_cast<const char*>(url.GetUTF8String()), wideURL);
        TOVCheck(locator->SetPath(wideURL.c_str()));
        TOVCheck(IAAFSmartPointer<IAAFEssenceDescriptor>(descriptor)->AppendLocator(locator));
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
