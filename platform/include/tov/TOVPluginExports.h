#pragma once
/// The six C functions that every plug-in module exports, and their types as
/// the host looks them up.
#include "tov/ITOVComponentDefinition.h"
#include "tov/ITOVPluginDefinition.h"
#include "tov/ITOVUnknown.h"

#define TOV_EXPORT extern "C" __attribute__((visibility("default")))

typedef TOVRESULT (*TOVRegisterPluginFn)(ITOVUnknown* host, ITOVPluginDefinition** out);
typedef TOVRESULT (*TOVRegisterComponentFn)(ITOVUnknown* host, unsigned int index, ITOVComponentDefinition** out);
typedef TOVRESULT (*TOVGetClassFactoryFn)(ITOVUnknown* host, const _tovUID& clsid, const _tovUID& iid, void** out);
typedef TOVRESULT (*TOVCanUnloadNowFn)(ITOVUnknown* host);
typedef TOVRESULT (*TOVStartupFn)(ITOVUnknown* host);
typedef TOVRESULT (*TOVShutdownFn)(ITOVUnknown* host);
