// Linking one member of a ten-file group, each ten seconds of 48 kHz 24-bit
// mono with bext and iXML, in a folder of 10,000 other files, in process with
// the plug-in started: NewMovieFromFilePath and NewAAFFromMovie together must
// take at most 5 ms (median). The split: reading the folder alone, the
// listing through the scheme's filter, the scan (listing, the members'
// intake and the group identity), the Movie (the given file and the scan),
// and the grouped clip. Times are this thread's processor time, user and
// system: the machine is shared, and wall time would count the other
// programs' turns.
#include <benchmark/benchmark.h>
#include <dirent.h>
#include <fcntl.h>
#include <unistd.h>

#include <ctime>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>
#include <vector>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ExampleGroup.h"
#include "aafbuilder/NewAAFFromMovie.h"
#include "boundary/NewMovieFromFilePath.h"
#include "boundary/PluginStartup.h"
#include "grouping/FindAndParseFilesForGrouping.h"
#include "grouping/ListAllFilesInFolder.h"
#include "grouping/VTImportFilter.h"
#include "startup/ZEBUtilLib.h"
#include "tov/host/TOVHost.h"

namespace {

constexpr int kMembers = 10;
constexpr int kOthers = 10000;
constexpr uint32_t kFrames = 10 * 48000;

double ThreadSeconds() {
    timespec now{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

ZEB::ZEBString Text(const std::string& text) {
    return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(text.c_str()));
}

// The folder, the plug-in started on a host, and the given member's path;
// made at the first benchmark's start, taken down at exit.
struct Session {
    Session() : host(TOVHost::Create()) {
        char pattern[] = "/tmp/orlo-bench-group-XXXXXX";
        if (!mkdtemp(pattern)) return;
        folder = pattern;
        Payload::Fmt fmt;
        fmt.channels = 1;
        const std::string samples(static_cast<size_t>(kFrames) * 3, '\x11');
        for (int channel = 1; channel <= kMembers; ++channel) {
            std::ofstream(folder + "/" + ExampleGroup::FileName(channel), std::ios::binary)
                << AudioFileWriter::Wave()
                       .Chunk("bext", ExampleGroup::BextPayload(channel))
                       .Chunk("fmt ", Payload::FmtChunk(fmt))
                       .Chunk("data", samples)
                       .Chunk("iXML", ExampleGroup::IxmlPayload(channel))
                       .Bytes();
        }
        // Other takes of the day, never opened.
        for (int i = 0; i < kOthers; ++i) {
            const std::string name =
                folder + "/" + std::to_string(i / 100) + "A-T" + std::to_string(i % 100) + "_1.wav";
            close(open(name.c_str(), O_CREAT | O_WRONLY, 0600));
        }
        host->Console().SetSink([](uint32_t, const std::string&) {});
        if (ZEB::ZEBInitialize(host.Get()) < 0) return;
        plugin = std::make_unique<PluginStartup>(host->AsUnknown());
        given = folder + "/" + ExampleGroup::FileName(4);
        givenPath = Text(given);
        OrloReader::Movie* made = nullptr;
        if (plugin->Result() == TOV_OK && ZEB::Impl::NewMovieFromFilePath(givenPath, &made, host.Get()) == TOV_OK &&
            made->IsMonophonicGroup() && made->GetTrackCount() == kMembers + 1)
            movie.reset(made);
        else
            delete made;
    }
    ~Session() {
        movie.reset();
        givenPath = ZEB::ZEBString();
        if (plugin) {
            plugin.reset();
            ZEB::ZEBTerminate();
        }
        if (!folder.empty()) std::filesystem::remove_all(folder);
    }

    TOVPtr<TOVHost> host;
    std::string folder, given;
    std::unique_ptr<PluginStartup> plugin;
    ZEB::ZEBString givenPath;
    std::unique_ptr<OrloReader::Movie> movie;
};

Session& Started() {
    static Session session;
    return session;
}

// Times `step` in this thread's processor time; false from it skips the run.
template <class Step>
void Time(benchmark::State& state, Step step) {
    if (!Started().movie) state.SkipWithError("the group did not form");
    for (auto _ : state) {
        const double start = ThreadSeconds();
        const bool done = step();
        state.SetIterationTime(ThreadSeconds() - start);
        if (!done) state.SkipWithError("the step failed");
    }
}

void BM_Group_0_ReadFolderAlone(benchmark::State& state) {
    Time(state, [] {
        DIR* entries = opendir(Started().folder.c_str());
        int count = 0;
        while (readdir(entries)) ++count;
        closedir(entries);
        return count == kOthers + kMembers + 2;
    });
}

void BM_Group_1_ListThroughFilter(benchmark::State& state) {
    const VTImportGrouping::VTImportFilter filter(Text(ExampleGroup::FileName(4)));
    Time(state, [&] {
        std::vector<ZEB::ZEBString> names;
        return HelperFunctions::ListAllFilesInFolder(Text(Started().folder + "/"), names, filter) &&
               names.size() == kMembers;
    });
}

void BM_Group_2_Scan(benchmark::State& state) {
    Time(state, [] {
        Session& session = Started();
        OrloReader::Movie movie;
        std::vector<std::shared_ptr<OrloReader::Track>> tracks;
        long long length = kFrames;
        _aafMobID_t id = session.movie->GetMobID();
        return GroupingFunctions::FindAndParseFilesForGrouping(session.givenPath, tracks, {48000, 1}, length, &id,
                                                               session.host.Get(), movie);
    });
}

void BM_Group_3_NewMovieFromFilePath(benchmark::State& state) {
    Time(state, [] {
        OrloReader::Movie* movie = nullptr;
        const bool made = ZEB::Impl::NewMovieFromFilePath(Started().givenPath, &movie, Started().host.Get()) == TOV_OK;
        delete movie;
        return made;
    });
}

void BM_Group_4_NewAAFFromMovie(benchmark::State& state) {
    Time(state, [] {
        Session& session = Started();
        IAAFFile* file = nullptr;
        const bool built =
            ZEB::Impl::NewAAFFromMovie(session.movie.get(), session.givenPath, &file, session.host.Get()) == TOV_OK;
        if (file) file->Release();
        return built;
    });
}

// The two calls of the container for the host's request for master clips.
void BM_Group_LinkOneMember(benchmark::State& state) {
    Time(state, [] {
        Session& session = Started();
        OrloReader::Movie* movie = nullptr;
        IAAFFile* file = nullptr;
        const bool linked = ZEB::Impl::NewMovieFromFilePath(session.givenPath, &movie, session.host.Get()) == TOV_OK &&
                            ZEB::Impl::NewAAFFromMovie(movie, session.givenPath, &file, session.host.Get()) == TOV_OK;
        if (file) file->Release();
        delete movie;
        return linked;
    });
}

void Repeated(benchmark::internal::Benchmark* b) {
    b->UseManualTime()->Unit(benchmark::kMillisecond)->Repetitions(9)->ReportAggregatesOnly();
}
BENCHMARK(BM_Group_0_ReadFolderAlone)->Apply(Repeated);
BENCHMARK(BM_Group_1_ListThroughFilter)->Apply(Repeated);
BENCHMARK(BM_Group_2_Scan)->Apply(Repeated);
BENCHMARK(BM_Group_3_NewMovieFromFilePath)->Apply(Repeated);
BENCHMARK(BM_Group_4_NewAAFFromMovie)->Apply(Repeated);
BENCHMARK(BM_Group_LinkOneMember)->Apply(Repeated);

}  // namespace

BENCHMARK_MAIN();
