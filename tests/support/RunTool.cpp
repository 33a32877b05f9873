#include "RunTool.h"

#include <sys/wait.h>

#include <cstdio>

ToolOutcome RunTool(const std::string& tool, const std::string& arguments) {
    const std::string command = tool + " " + arguments + " 2>/dev/null";
    ToolOutcome outcome{-1, ""};
    FILE* pipe = popen(command.c_str(), "r");
    if (!pipe) return outcome;
    char buffer[4096];
    size_t got;
    while ((got = std::fread(buffer, 1, sizeof buffer, pipe)) > 0) outcome.out.append(buffer, got);
    const int status = pclose(pipe);
    outcome.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    return outcome;
}
