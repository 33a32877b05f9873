#pragma once
/// A fixture that starts the plug-in on a test host as its module does, for
/// building the clips of Movies made from files or by hand.
#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <string>

#include "AAFTestFile.h"
#include "boundary/PluginStartup.h"
#include "TestHost.h"
#include "aaf/AAF.h"
#include "aaf/dumpAAF.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"

class BuilderTest : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    static ZEB::ZEBString Text(const std::string& text);
    /// The Movie the intake makes of `bytes` written as `name` in this test's folder.
    std::unique_ptr<OrloReader::Movie> Load(const std::string& name, const std::string& bytes);
    /// A Movie as the intake makes one of a mono 48 kHz file of `samples`:
    /// a timecode track, one audio track, edit rate 48000/1, tape rate `tapeRate`.
    static std::unique_ptr<OrloReader::Movie> Hand(unsigned long long samples, _aafRational_t tapeRate);
    /// NewAAFFromMovie of `movie` with `path` as the file's place.
    TOVRESULT Build(OrloReader::Movie* movie, aaftest::Ptr<IAAFFile>& out,
                    const std::string& path = "/media/day1/clip.wav");
    /// The text dump of a file or an object, without clock values.
    template <class Root>
    static std::string Dump(Root* root) {
        ZEB::AAFDumpOptions options;
        options.omitClock = true;
        std::ostringstream out;
        EXPECT_EQ(ZEB::dumpAAF(root, out, options), AAFRESULT_SUCCESS);
        return out.str();
    }

    TestHost host;
    std::unique_ptr<PluginStartup> startup;
    std::string folder;
};
