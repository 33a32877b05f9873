#pragma once
/// Why the plug-in made no clip of a file, as the tool tells it.
#include <nlohmann/json.hpp>
#include <string>

#include "tov/TOVResult.h"

/// Says on stderr that the plug-in made no clip of `path` (`result`), with
/// the chunk stream's error when it has one, since the plug-in itself gives
/// only a code. Returns that error, or null.
nlohmann::ordered_json SayNoClip(const std::string& path, TOVRESULT result);
