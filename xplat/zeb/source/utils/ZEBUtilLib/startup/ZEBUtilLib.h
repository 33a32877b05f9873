#pragma once
/// Start-up of the utility library: the host services it needs before anything
/// else works, fetched once from the host's component factory.
#include <cstdint>

#include "tov/ITOVClassFactory.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/ITOVConsole.h"

namespace ZEB {
namespace ZEBUtilLib {

/// How many ZEBInitialize calls stand against ZEBTerminate calls. Plain, not
/// atomic: start-up and shutdown run on the host's start and stop path only.
extern uint32_t gZEBRef;
/// One reference each while the library is started; null otherwise.
extern ITOVComponentFactory* gpComponentFactory;
/// Makes ITOVString objects.
extern ITOVClassFactory* gpClassFactory;
/// Where ZEBLogger writes.
extern ITOVConsole* gpConsole;

}  // namespace ZEBUtilLib

/// Starts the library on `factory`. A second start returns ZEB_E_ALREADYSET
/// (the library stays usable) and needs a ZEBTerminate of its own.
TOVRESULT ZEBInitialize(ITOVComponentFactory* factory);
/// The same; the second argument is not used.
TOVRESULT ZEBInitialize(ITOVComponentFactory* factory, unsigned char* unused);
TOVRESULT ZEBInitializeInternal(ITOVComponentFactory* factory, unsigned char* unused);
/// Pays for one start; the last one gives the host services back. Always 0.
TOVRESULT ZEBTerminate();

}  // namespace ZEB
