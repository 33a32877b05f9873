#pragma once
/// The plug-in's seven components as the module registers them: identifiers,
/// registered name and creator, by the index `TOVRegisterComponent` is given.
#include "tov/sdk/CTOVClassFactory.h"

struct OrloComponent {
    _tovUID compID;
    _tovUID clsid;
    /// The registered name, which for two rows differs from the class's.
    const wchar_t* name;
    /// The class's `TOVCreate`; null for a class that is not built yet.
    CTOVClassFactory::Creator creator;
};

inline constexpr unsigned int kOrloComponentCount = 7;
extern const OrloComponent kOrloComponents[kOrloComponentCount];
