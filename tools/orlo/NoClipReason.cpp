#include "NoClipReason.h"

#include <cstdio>

#include "ResultText.h"
#include "reader/OrloStream.h"

nlohmann::ordered_json SayNoClip(const std::string& path, TOVRESULT result) {
    const Orlo::OrloStream stream(path.c_str(), Orlo::kAllChunks);
    const char* error = stream.GetError();
    std::fprintf(stderr, "orlo: %s: the plug-in made no clip of it (%s)%s%s\n", path.c_str(),
                 ResultText(result).c_str(), error ? ": " : "", error ? error : "");
    return error ? nlohmann::ordered_json(error) : nlohmann::ordered_json(nullptr);
}
