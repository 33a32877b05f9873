#include "AAFUnloadWrapper.h"

#include "AAFLoaderPlatform.h"

AAFUnloadWrapper g_GuarenteeAAFUnload;

AAFUnloadWrapper::~AAFUnloadWrapper() { AAFUnload(); }
