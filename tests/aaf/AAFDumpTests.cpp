// The worked examples of the clip builder, built through the loader and
// dumped, compared with the golden files (which show dynamic properties by
// name too); and what the dump shows of clocks. ORLO_UPDATE_GOLDEN=1 rewrites
// the golden files.
#include <gtest/gtest.h>

#include <sstream>
#include <string>

#include "AAFTestFile.h"
#include "ExampleClips.h"
#include "GoldenDump.h"
#include "aaf/dumpAAF.h"

using namespace aaftest;

namespace {

std::string Dump(IAAFFile* file, ZEB::AAFDumpOptions options) {
    std::ostringstream out;
    EXPECT_EQ(ZEB::dumpAAF(file, out, options), AAFRESULT_SUCCESS);
    return out.str();
}

void CompareWithGolden(const std::string& dump, const std::string& name) {
    ExpectMatchesGolden(dump, std::string(AAF_GOLDEN_DIR) + "/" + name);
}

struct GoldenCase {
    const char* name;
    IAAFFile* (*build)();
    ZEB::AAFDumpOptions::Format format;
    const char* golden;
};

// Names the case in test output instead of its bytes.
void PrintTo(const GoldenCase& c, std::ostream* out) { *out << c.name; }

IAAFFile* Grouped125() { return BuildGroupedClip({1, 2, 5}); }

class AAFDumpGolden : public ::testing::TestWithParam<GoldenCase> {};

TEST_P(AAFDumpGolden, MatchesTheGoldenFile) {
    const GoldenCase& c = GetParam();
    Ptr<IAAFFile> file;
    ASSERT_NO_THROW(*file.out() = c.build());
    ZEB::AAFDumpOptions options;
    options.format = c.format;
    options.omitClock = true;
    CompareWithGolden(Dump(file.get(), options), c.golden);
}

INSTANTIATE_TEST_SUITE_P(
    Examples, AAFDumpGolden,
    ::testing::Values(GoldenCase{"StereoText", &BuildStereoClip, ZEB::AAFDumpOptions::Format::Text, "stereo_clip.txt"},
                      GoldenCase{"StereoJSON", &BuildStereoClip, ZEB::AAFDumpOptions::Format::JSON, "stereo_clip.json"},
                      GoldenCase{"GroupedText", &Grouped125, ZEB::AAFDumpOptions::Format::Text, "grouped_clip.txt"},
                      GoldenCase{"GroupedJSON", &Grouped125, ZEB::AAFDumpOptions::Format::JSON, "grouped_clip.json"},
                      GoldenCase{"MetadataText", &BuildMetadataClip, ZEB::AAFDumpOptions::Format::Text,
                                 "metadata_clip.txt"}),
    [](const auto& info) { return std::string(info.param.name); });

TEST(AAFDump, ClockValuesAppearUnlessOmitted) {
    Ptr<IAAFFile> file;
    *file.out() = BuildStereoClip();
    ZEB::AAFDumpOptions options;
    EXPECT_NE(Dump(file.get(), options).find("CreationTime"), std::string::npos);
    options.omitClock = true;
    const std::string dump = Dump(file.get(), options);
    for (const char* clock : {"CreationTime", "LastModified", "Date:"})
        EXPECT_EQ(dump.find(clock), std::string::npos) << clock;
}

TEST(AAFDump, NullArguments) {
    std::ostringstream out;
    EXPECT_EQ(ZEB::dumpAAF(static_cast<IAAFFile*>(nullptr), out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(ZEB::dumpAAF(static_cast<IAAFObject*>(nullptr), out), AAFRESULT_NULL_PARAM);
}

}  // namespace
