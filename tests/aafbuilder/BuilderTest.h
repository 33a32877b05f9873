#pragma once
/// A fixture that starts the plug-in on a test host as its module does, for
/// building clips of Movies made from files or by hand, and comparing their
/// dumps with the golden files.
#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "PluginStartup.h"
#include "TestHost.h"
#include "aaf/AAF.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"

/// A file reference that releases the file when it goes.
struct FileRef {
    FileRef() = default;
    FileRef(const FileRef&) = delete;
    FileRef& operator=(const FileRef&) = delete;
    ~FileRef() {
        if (file) file->Release();
    }
    IAAFFile* file = nullptr;
};

/// What a hand-made Movie holds: one timecode track, then `channels` audio
/// tracks of `samples` at 48 kHz, 24 bits, edit rate 48000/1, tape rate 25/1.
struct HandClip {
    uint32_t channels = 2;
    unsigned long long samples = 48000;
    _aafRational_t tapeRate{25, 1};
};

class BuilderTest : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    static ZEB::ZEBString Text(const std::string& text);
    /// Writes `bytes` as `name` in this test's folder and returns the path.
    std::string Write(const std::string& name, const std::string& bytes);
    /// The Movie the intake makes of `path`; null when it fails.
    std::unique_ptr<OrloReader::Movie> Load(const std::string& path);
    static std::unique_ptr<OrloReader::Movie> Hand(const HandClip& clip);
    /// NewAAFFromMovie of `movie` with `path` as the file's place.
    TOVRESULT Build(OrloReader::Movie* movie, FileRef& out, const std::string& path = "/media/day1/clip.wav");

    /// The text dump without clock values.
    static std::string Dump(IAAFFile* file);
    /// Compares `dump` with golden file `name`; ORLO_UPDATE_GOLDEN=1 writes it first.
    static void ExpectGolden(const std::string& dump, const std::string& name);

    TestHost host;
    std::unique_ptr<PluginStartup> startup;
    std::string folder;
};
