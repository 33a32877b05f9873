#include "grouping/GroupScan.h"

#include <sys/stat.h>

#include <exception>

#include "clipmodel/AudioTracks.h"
#include "clipmodel/MetadataSelection.h"
#include "clipmodel/MobIDFromMetadata.h"
#include "reader/ByteSwap.h"
#include "reader/OrloStream.h"
#include "reader/UMIDChunk.h"
#include "reader/ixml/IXMLChunk.h"
#include "reader/ixml/ParceRawIXML.h"
#include "strings/ZEBStringUtils.h"

namespace GroupingFunctions {

namespace {

using namespace OrloReader;

// Any mask but 0 reads every chunk; this is the value the scan has always passed.
constexpr unsigned int kMemberChunks = 0x82;

// The metadata of one member. Track names and comments gather from every
// member; every other attribute comes from the first member, in listing
// order, that has it.
void FeedMovie(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml, bool hasIxml,
               const ZEB::ZEBString& path, Movie& movie) {
    AddTrkFromMetadataMonophonic(bext, hasBext, ixml, hasIxml, movie);
    AddCommentsFromMetadata(bext, hasBext, ixml, hasIxml, movie);
    AddUserCommentsFromMetadata(ixml, hasIxml, movie);
    if (!movie.HasMovieUBITS()) AddUBITSFromMetadata(bext, hasBext, ixml, hasIxml, movie);
    if (!movie.HasMovieProject()) AddProjectFromMetadata(ixml, hasIxml, movie);
    if (!movie.HasMovieCircled()) AddCircledFromMetadata(bext, hasBext, ixml, hasIxml, movie);
    if (!movie.HasMovieWildTrack()) AddWildTrackFromMetadata(ixml, hasIxml, movie);
    if (!movie.HasMovieFalseStart()) AddFalseStartFromMetadata(ixml, hasIxml, movie);
    if (!movie.HasMovieNoGood()) AddNoGoodFromMetadata(ixml, hasIxml, movie);
    if (!movie.HasMovieScene()) AddSceneFromMetadata(bext, hasBext, ixml, hasIxml, movie);
    if (!movie.HasMovieTake()) AddTakeFromMetadata(bext, hasBext, ixml, hasIxml, movie);
    if (!movie.HasMovieShootDate()) AddShootDateFromMetadata(bext, hasBext, path, movie);
}

bool TakeIn(const ZEB::ZEBString& path, unsigned char channelIndex, long long& groupLength,
            ITOVComponentFactory* factory, Movie& movie, std::vector<std::shared_ptr<Track>>& tracks,
            _aafMobID_t& memberID) {
    ZEB::ZEBString utf8Path(path);
    utf8Path.ConvertTo(kTOVUnicodeUTF8);
    const char* file = reinterpret_cast<const char*>(utf8Path.GetUTF8String());
    // Only plain files are opened: a pipe named like a member would wait for
    // a writer for ever, and a device has no end.
    struct stat status {};
    if (stat(file, &status) != 0 || !S_ISREG(status.st_mode)) return false;
    const Orlo::OrloStream stream(file, kMemberChunks);
    if (stream.GetError() != nullptr || stream.GetChannelCount() != 1) return false;
    // Everything that can refuse the file is read before the Movie changes.
    const auto sampleCount = static_cast<long long>(stream.GetSampleCount());
    const auto descriptor = std::make_shared<AudioMediaDescriptor>(
        kAudioFormatPCM, stream.GetSampleRate(), stream.GetSampleSize(), stream.GetSampleSize(), 1,
        stream.GetBitsPerSample(), stream.GetIsDataWrongEndian() && HelperFunctions::IAmLittleEndian(),
        stream.GetIsDataFloatingPoint(), static_cast<unsigned long long>(stream.GetStartPosition()));
    Chunks::IXML::IXMLData ixml;
    const bool hasIxml =
        stream.HasChunk(Orlo::OrloStream::IXML_CHUNK) &&
        Chunks::IXML::ParceRawIXML(stream.GetChunk<Chunks::IXML::IXMLChunk>()->GetRawXml(), factory, ixml) == 0;
    const auto bextChunk = stream.GetChunk<Chunks::BEXT::BEXTChunk>();
    const bool hasBext = stream.HasChunk(Orlo::OrloStream::BEXT_CHUNK) && bextChunk != nullptr;
    const bool hasUmid = stream.HasChunk(Orlo::OrloStream::UMID_CHUNK);
    memberID = MobIDFromMetadata(bextChunk.get(), hasBext, ixml, hasIxml,
                                 stream.GetChunk<Chunks::UMID::UMIDChunk>().get(), hasUmid, path);

    if (sampleCount > groupLength) groupLength = sampleCount;
    FeedMovie(bextChunk.get(), hasBext, ixml, hasIxml, path, movie);
    tracks.push_back(std::make_shared<Track>(TimeCodeInfo(), stream.GetSampleSize(), sampleCount, channelIndex,
                                             descriptor, path, memberID.material));
    return true;
}

}  // namespace

void SplitGroupPath(const ZEB::ZEBString& path, ZEB::ZEBString& folder, ZEB::ZEBString& name) {
    folder = ZEB::ZEBStringUtils::GetParentFolder(path);
    name = ZEB::ZEBStringUtils::GetSubString(path, folder.GetNumCharacters(), -1);
}

bool AddGroupMember(const ZEB::ZEBString& folder, const ZEB::ZEBString& name, unsigned char channelIndex,
                    long long& groupLength, ITOVComponentFactory* factory, Movie& movie,
                    std::vector<std::shared_ptr<Track>>& tracks, _aafMobID_t& memberID) {
    try {
        return TakeIn(folder + name, channelIndex, groupLength, factory, movie, tracks, memberID);
    } catch (const std::exception&) {
        return false;
    } catch (int) {
        // A result code: no identity could be derived from the file.
        return false;
    }
}

}  // namespace GroupingFunctions
