#pragma once
/// The plug-in module loaded by a test host as an editing host loads it, with
/// what a test needs to drive its components: host strings and the container.
#include <string>

#include "TestHost.h"
#include "tov/IMediaContainer3.h"

class LoadedModule {
public:
    /// Loads the built module; a failure fails the test that made it.
    LoadedModule();

    TestHost host;

    /// A host string holding `text` as UTF-8.
    TOVPtr<ITOVString> Text(const std::string& text);
    /// A container made through the host's factory, with `path` set unless empty.
    TOVPtr<IMediaContainer3> Container(const std::string& path);
};

/// The text of a string that the caller owns, released here.
std::string TakeText(ITOVString* string);
