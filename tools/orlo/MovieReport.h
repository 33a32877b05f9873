#pragma once
/// A finished Movie as JSON: every attribute, null where its has flag is
/// false, and one entry per track.
#include <nlohmann/json.hpp>

#include "clipmodel/Movie.h"

nlohmann::ordered_json MovieReport(const OrloReader::Movie& movie);
