#pragma once
/// A fixture that starts the plug-in's globals on a test host (utility
/// library, factory, console, toggles) as the module does, and writes audio
/// files into a folder of its own.
#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>

#include "ChunkPayloads.h"
#include "TestHost.h"
#include "boundary/PluginStartup.h"
#include "clipmodel/Movie.h"

/// What one test file holds; empty texts leave their chunk out.
struct ClipFile {
    uint16_t channels = 2;
    uint16_t bits = 24;
    uint32_t rate = 48000;
    uint32_t frames = 100;
    std::optional<Payload::Bext> bext;
    /// The iXML chunk's text as it stands.
    std::string ixml;
    /// The `umid` chunk's payload.
    std::string umid;

    /// The file as a RIFF/WAVE, with fmt, bext, iXML, umid and data in that order.
    std::string Bytes() const;
};

/// An iXML document around `body`.
std::string Ixml(const std::string& body);
/// A `bext` chunk whose Description holds `keywords` ("sSCENE=12\r\n..."),
/// with no date, time or time reference unless the test sets them.
Payload::Bext BextWith(const std::string& keywords);

class ClipFixture : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    /// Writes `bytes` as `name` in this test's folder (or a sub-folder given in
    /// the name) and returns the path.
    std::string Write(const std::string& name, const std::string& bytes);
    /// InitFromFile on `path` with grouping allowed.
    TOVRESULT Load(const std::string& path, OrloReader::Movie& movie);
    /// Writes the file and loads it, expecting success.
    OrloReader::Movie LoadFile(const ClipFile& file, const std::string& name = "clip.wav");
    void SetToggle(const char* path, unsigned int value);

    std::string folder;
    TestHost host;
    std::unique_ptr<PluginStartup> startup;
};
