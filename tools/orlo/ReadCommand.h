#pragma once
#include <string>
#include <vector>

#include "OrloCommand.h"

/// Reads a file's PCM as an editing host does, at the positions the loaded
/// module's sample map gives, in large reads: to an MD5 of the sample bytes as
/// stored, or to a standard WAV file of the chosen channels.
class ReadCommand : public OrloCommand {
public:
    CLI::App* Declare(CLI::App& app) override;
    /// 0 when every frame was read (and written), 1 otherwise.
    int Run(const OrloOptions& options) override;

private:
    std::string m_Path;
    std::string m_Output;
    std::string m_Module;
    std::vector<unsigned int> m_Channels;
    bool m_Md5 = false;
    bool m_Json = false;
};
