// The transient AAF file of the example take (stereo, bext and iXML, one
// timecode track, ten comments) as the container builds it: NewAAFFromMovie
// must take at most 30 microseconds (median). The stages are timed apart as
// well, each on a file made untimed up to it, with the builder's own pieces in
// its order: opening the transient file, the Mobs and their slots (the PCM
// descriptor filled on the way), the descriptors with their locators, and the
// comments. A file whose format chunk claims 65,535 channels of one frame
// must be built (Movie and clip) in time and memory linear in the channels;
// the two halves' times and the peak resident size are reported.
#include <benchmark/benchmark.h>
#include <sys/resource.h>

#include <ctime>
#include <memory>
#include <string>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "ExampleTake.h"
#include "boundary/PluginStartup.h"
#include "TempFile.h"
#include "aaf/AAFDescriptorExtensions.h"
#include "aafbuilder/AddAudioDescriptor.h"
#include "aafbuilder/AddAudioTracksToAAF.h"
#include "aafbuilder/AddLocator.h"
#include "aafbuilder/AddMovieMetaData.h"
#include "aafbuilder/AddTimecode.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "aafbuilder/NewAAFFromMovie.h"
#include "boundary/NewMovieFromFilePath.h"
#include "boundary/OrloRegInfo.h"
#include "identity/GetProductID.h"
#include "startup/ZEBUtilLib.h"
#include "time/GetMaxDuration.h"
#include "tov/host/TOVHost.h"

namespace {

// The stages are timed in this thread's processor time: the machine is shared,
// and wall time would count the other programs' turns.
double ThreadSeconds() {
    timespec now{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}
using namespace ZEB::Impl;

// The plug-in started in process, and the Movie of the example take, made at
// the first benchmark's start and stopped at exit.
struct Session {
    Session() : host(TOVHost::Create()) {
        host->Console().SetSink([](uint32_t, const std::string&) {});
        if (ZEB::ZEBInitialize(host.Get()) < 0) return;
        plugin = std::make_unique<PluginStartup>(host->AsUnknown());
        take = std::make_unique<TempFile>(ExampleTake::File());
        takePath = ZEB::ZEBString(reinterpret_cast<const unsigned char*>(take->Path().c_str()));
        OrloReader::Movie* made = nullptr;
        if (plugin->Result() == TOV_OK && NewMovieFromFilePath(takePath, &made, host.Get()) == TOV_OK)
            movie.reset(made);
    }
    ~Session() {
        movie.reset();
        takePath = ZEB::ZEBString();
        if (plugin) {
            plugin.reset();
            ZEB::ZEBTerminate();
        }
    }

    TOVPtr<TOVHost> host;
    std::unique_ptr<PluginStartup> plugin;
    std::unique_ptr<TempFile> take;
    ZEB::ZEBString takePath;
    std::unique_ptr<OrloReader::Movie> movie;
};

Session& Started() {
    static Session session;
    return session;
}

// The transient file and what the stages fill, up to the stage being timed.
struct Clip {
    Session& session = Started();
    IAAFFile* file = nullptr;
    IAAFSmartPointer<IAAFHeader> header;
    IAAFSmartPointer<IAAFDictionary> dictionary;
    IAAFSmartPointer<IAAFMob> master, fileMob, tapeMob;
    IAAFSmartPointer<IAAFPCMDescriptor> pcm;

    ~Clip() {
        if (file) file->Release();
    }

    void Open() {
        aafProductIdentification_t product;
        ZEB::GetProductID(product, 1, 9, 1, 10178, OrloRegInfo::kVendorName, OrloRegInfo::kPluginName,
                          OrloRegInfo::kVersionWideText, OrloRegInfo::CompID_OrloReaderMovContainer);
        AAFFileOpenTransient(&product, &file);
        file->GetHeader(&header);
        header->GetDictionary(&dictionary);
    }

    IAAFSmartPointer<IAAFMob> NewMob(const aafUID_t& cls, aafUInt8 instance, const wchar_t* name) {
        IAAFSmartPointer<IAAFMob> mob;
        dictionary->CreateInstance(cls, IID_IAAFMob, reinterpret_cast<IUnknown**>(&mob));
        if (cls == AUID_AAFMasterMob) {
            IAAFSmartPointer<IAAFMasterMob> m;
            mob->QueryInterface(IID_IAAFMasterMob, reinterpret_cast<void**>(&m));
            m->Initialize();
        } else {
            IAAFSmartPointer<IAAFSourceMob> s;
            mob->QueryInterface(IID_IAAFSourceMob, reinterpret_cast<void**>(&s));
            s->Initialize();
        }
        aafMobID_t id = session.movie->GetMobID();
        if (instance) id.instanceHigh = instance;
        mob->SetMobID(id);
        mob->SetName(name);
        return mob;
    }

    template <class I>
    IAAFSmartPointer<I> As(IAAFMob* mob) {
        IAAFSmartPointer<I> out;
        mob->QueryInterface(AAFInterfaceID<I>::value, reinterpret_cast<void**>(&out));
        return out;
    }

    void MobsAndSlots() {
        master = NewMob(AUID_AAFMasterMob, 0, L"12A/3");
        fileMob = NewMob(AUID_AAFSourceMob, 0xB1, L"12A-T03.wav");
        tapeMob = NewMob(AUID_AAFSourceMob, 0xA1, L"DAY01");
        dictionary->CreateInstance(AUID_AAFPCMDescriptor, IID_IAAFPCMDescriptor, reinterpret_cast<IUnknown**>(&pcm));
        pcm->Initialize();
        const aafRational_t tapeRate = session.movie->GetTapeMobEditRate().GetRationalFramerate();
        _aafTimecode_t timecode{0, 0, 25};
        const long long length = ZEB::GetMaxDuration(25, false), none = 0;
        AddTimecodeAAFTrack(timecode, 0, 0, tapeRate, length, none, none, dictionary, tapeMob);
        int timecodeCount = 1, audioCount = 0;
        AddAudioTracksToAAF(session.movie.get(), 1, timecodeCount, audioCount, session.movie->GetMovieEditRate(),
                            session.movie->GetMovieStartOffset(), dictionary, master, As<IAAFMasterMob>(master),
                            fileMob, As<IAAFSourceMob>(fileMob), tapeMob, As<IAAFSourceMob>(tapeMob), pcm);
    }

    void Descriptors() {
        IAAFSmartPointer<IAAFEssenceDescriptor> essence;
        pcm->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&essence));
        AddLocator(session.takePath, dictionary, essence);
        ZEB::AAFUtils::SetMediaContainerGUID(dictionary, essence, OrloRegInfo::CompID_OrloReaderMovContainer);
        IAAFSmartPointer<IAAFFileDescriptor> fileDescriptor;
        pcm->QueryInterface(IID_IAAFFileDescriptor, reinterpret_cast<void**>(&fileDescriptor));
        ZEB::AAFUtils::SetMediaAccessKind(dictionary, fileDescriptor, 3);
        As<IAAFSourceMob>(fileMob)->SetEssenceDescriptor(essence);
        IAAFSmartPointer<IAAFEssenceDescriptor> tape;
        dictionary->CreateInstance(AUID_AAFTapeDescriptor, IID_IAAFEssenceDescriptor,
                                   reinterpret_cast<IUnknown**>(&tape));
        AddLocator(session.takePath, dictionary, tape);
        ZEB::AAFUtils::SetMediaContainerGUID(dictionary, tape, OrloRegInfo::CompID_OrloReaderMovContainer);
        As<IAAFSourceMob>(tapeMob)->SetEssenceDescriptor(tape);
    }

    void Comments() { AddMovieMetaData(master, session.movie.get()); }
};

// Times `stage` alone, after `untimed` has brought a fresh clip up to it.
template <class Untimed, class Stage>
void TimeStage(benchmark::State& state, Untimed untimed, Stage stage) {
    if (!Started().movie) state.SkipWithError("no Movie of the example take");
    for (auto _ : state) {
        auto clip = std::make_unique<Clip>();
        untimed(*clip);
        const double start = ThreadSeconds();
        stage(*clip);
        state.SetIterationTime(ThreadSeconds() - start);
        benchmark::DoNotOptimize(clip->file);
    }
}

void BM_ExampleTake_1_OpenTransientFile(benchmark::State& state) {
    TimeStage(
        state, [](Clip&) {}, [](Clip& c) { c.Open(); });
}

void BM_ExampleTake_2_MobsAndSlots(benchmark::State& state) {
    TimeStage(
        state, [](Clip& c) { c.Open(); }, [](Clip& c) { c.MobsAndSlots(); });
}

void BM_ExampleTake_3_Descriptors(benchmark::State& state) {
    TimeStage(
        state,
        [](Clip& c) {
            c.Open();
            c.MobsAndSlots();
        },
        [](Clip& c) { c.Descriptors(); });
}

void BM_ExampleTake_4_Comments(benchmark::State& state) {
    TimeStage(
        state,
        [](Clip& c) {
            c.Open();
            c.MobsAndSlots();
            c.Descriptors();
        },
        [](Clip& c) { c.Comments(); });
}

// The whole build, as the container calls it; the host's release of the file is not timed.
void BM_ExampleTake_NewAAFFromMovie(benchmark::State& state) {
    Session& session = Started();
    if (!session.movie) state.SkipWithError("no Movie of the example take");
    for (auto _ : state) {
        IAAFFile* file = nullptr;
        const double start = ThreadSeconds();
        if (NewAAFFromMovie(session.movie.get(), session.takePath, &file, session.host.Get()) != TOV_OK)
            state.SkipWithError("no clip");
        state.SetIterationTime(ThreadSeconds() - start);
        if (file) file->Release();
    }
}

// Every channel of 16 bits, one frame: the block align field cannot hold the
// frame's size and wraps, as a recorder that miscounted would leave it.
std::string WideFile(uint16_t channels) {
    Payload::Fmt fmt;
    fmt.channels = channels;
    fmt.bits = 16;
    return AudioFileWriter::Wave()
        .Chunk("fmt ", Payload::FmtChunk(fmt))
        .Chunk("data", std::string(size_t{channels} * 2, '\0'))
        .Bytes();
}

// The Movie and its clip, timed apart in the counters; the peak resident
// size is the whole process's, the runs before this one included.
void BM_WideFile_MovieAndClip(benchmark::State& state) {
    Session& session = Started();
    const TempFile wide(WideFile(static_cast<uint16_t>(state.range(0))));
    const ZEB::ZEBString path(reinterpret_cast<const unsigned char*>(wide.Path().c_str()));
    double movieSeconds = 0, clipSeconds = 0;
    for (auto _ : state) {
        OrloReader::Movie* movie = nullptr;
        IAAFFile* file = nullptr;
        const double start = ThreadSeconds();
        const TOVRESULT intake = NewMovieFromFilePath(path, &movie, session.host.Get());
        const double made = ThreadSeconds();
        if (intake != TOV_OK || NewAAFFromMovie(movie, path, &file, session.host.Get()) != TOV_OK)
            state.SkipWithError("no clip");
        clipSeconds += ThreadSeconds() - made;
        movieSeconds += made - start;
        if (file) file->Release();
        delete movie;
    }
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    state.counters["movie_s"] = benchmark::Counter(movieSeconds, benchmark::Counter::kAvgIterations);
    state.counters["clip_s"] = benchmark::Counter(clipSeconds, benchmark::Counter::kAvgIterations);
    state.counters["peak_MiB"] = static_cast<double>(usage.ru_maxrss) / 1024.0;
}

// The median of nine runs, each in this thread's processor time.
void Repeated(benchmark::internal::Benchmark* b) {
    b->UseManualTime()->Unit(benchmark::kMicrosecond)->Repetitions(9)->ReportAggregatesOnly();
}
BENCHMARK(BM_ExampleTake_1_OpenTransientFile)->Apply(Repeated);
BENCHMARK(BM_ExampleTake_2_MobsAndSlots)->Apply(Repeated);
BENCHMARK(BM_ExampleTake_3_Descriptors)->Apply(Repeated);
BENCHMARK(BM_ExampleTake_4_Comments)->Apply(Repeated);
BENCHMARK(BM_ExampleTake_NewAAFFromMovie)->Apply(Repeated);
BENCHMARK(BM_WideFile_MovieAndClip)->Arg(65535)->Unit(benchmark::kMillisecond)->Iterations(1);

}  // namespace

BENCHMARK_MAIN();
