#include "boundary/ModuleGlobals.h"

ZEB::ZEBLogger g_logger;
