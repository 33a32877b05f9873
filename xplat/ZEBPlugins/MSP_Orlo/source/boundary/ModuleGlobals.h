#pragma once
/// The module's globals: the logger and console every message of the plug-in
/// goes through, and the host's factory that the clip model reads toggles
/// through. Each pointer holds one reference while it is set.
#include "startup/ZEBLogger.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/ITOVConsole.h"

/// Named at start-up; it has no name until the module starts.
extern ZEB::ZEBLogger g_logger;
/// The host's console from the end of start-up to shutdown; null if the host has none.
extern ITOVConsole* g_pConsole;

namespace OrloReader {

/// The host's factory from InitOrloReader to ShutdownOrloReader; null otherwise.
extern ITOVComponentFactory* s_pComponentFactory;

/// Keeps the host's factory in s_pComponentFactory unless one is kept already.
/// A failed query is thrown as its result, a null host as TOV_E_POINTER (both as an `int`).
void InitOrloReader(ITOVUnknown* host);
/// Clears s_pComponentFactory and releases the factory, if one is kept.
void ShutdownOrloReader();

}  // namespace OrloReader
