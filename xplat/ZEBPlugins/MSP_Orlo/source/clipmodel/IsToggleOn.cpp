#include "clipmodel/IsToggleOn.h"

#include "boundary/DynamicToggles.h"
#include "boundary/ModuleGlobals.h"

namespace OrloReader {

bool IsToggleOn(const char* path) {
    unsigned int value = 0;
    const TOVRESULT result = ZEB::Impl::RetrieveDynamicToggleValue(s_pComponentFactory, path, &value);
    return result >= 0 && value != 0;
}

}  // namespace OrloReader
