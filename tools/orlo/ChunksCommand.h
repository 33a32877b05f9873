#pragma once
#include <string>

#include "OrloCommand.h"

/// Shows what the chunk stream made of one file: the accepted chunks, the
/// sample layout, bext and umid, or why the stream failed.
class ChunksCommand : public OrloCommand {
public:
    CLI::App* Declare(CLI::App& app) override;
    /// 0 when the stream is good, 1 when it failed.
    int Run(const OrloOptions& options) override;

private:
    std::string m_Path;
    bool m_Json = false;
};
