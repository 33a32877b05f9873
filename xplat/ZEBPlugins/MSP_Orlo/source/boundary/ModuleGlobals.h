#pragma once
/// The plug-in's message global: every message of the plug-in goes through it
/// to the host's console. It has no name until the module starts.
#include "startup/ZEBLogger.h"

extern ZEB::ZEBLogger g_logger;
