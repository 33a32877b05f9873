#pragma once
/// The reference host that a fuzz target runs over: started once per process,
/// with the utility library on it and every console line formatted, then dropped.
#include "tov/host/TOVHost.h"

/// The host's factory; aborts when the host's services cannot start.
ITOVComponentFactory* StartFuzzHost();
