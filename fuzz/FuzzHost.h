#pragma once
/// The reference host that a fuzz target runs over: started once per process,
/// with the utility library on it and every console line formatted, then dropped.
#include "tov/host/TOVHost.h"

/// The host, which is also its factory; aborts when its services cannot start.
TOVHost* StartFuzzHost();
