#pragma once
/// Runs a built command-line tool as a person would, for end-to-end tests.
#include <string>

struct ToolOutcome {
    int status;       ///< exit status, or -1 when the tool did not exit normally
    std::string out;  ///< what it wrote to stdout
};

/// Runs `tool` with `arguments` (shell words) and stderr discarded.
ToolOutcome RunTool(const std::string& tool, const std::string& arguments);
