#include "clipmodel/AudioTracks.h"

#include <algorithm>
#include <string>

#include "clipmodel/TextHelpers.h"
#include "grouping/ConvertAlphaIndexToNumber.h"
#include "grouping/FindAndParseFilesForGrouping.h"
#include "reader/ByteSwap.h"
#include "reader/ixml/IXMLTextParsers.h"

namespace OrloReader {

namespace {

using Chunks::IXML::IXMLTrack;

bool EveryEntryHasBothIndices(const std::vector<IXMLTrack>& list) {
    return std::all_of(list.begin(), list.end(),
                       [](const IXMLTrack& t) { return t.HasChannelIndex() && t.HasInterleaveIndex(); });
}

// Entries of equal interleave index keep their order in the document.
std::vector<IXMLTrack> SortedByInterleave(std::vector<IXMLTrack> list) {
    std::stable_sort(list.begin(), list.end(), InterleaveIndexComparator);
    return list;
}

// The `bext` TRK keywords, as they reach the Movie. The conversion of
// lettered keys yields an empty map, so nothing is ever inserted here; the
// steps stand as the plug-in has always run them.
bool MergeBextTrkKeywords(const Chunks::BEXT::BEXTChunk* bext, Movie& movie) {
    if (bext == nullptr) return false;
    const auto converted = HelperFunctions::ConvertAlphaIndexToNumber(bext->GetConstParsedDescriptionField());
    HelperFunctions::TrkMap trks = movie.GetMovieTRKs();
    for (const auto& entry : converted)
        if (HelperFunctions::IsKeywordTRK(entry.first)) trks.insert(entry);
    if (trks.empty()) return false;
    movie.SetMovieTRKs(trks);
    return true;
}

}  // namespace

bool InterleaveIndexComparator(IXMLTrack a, IXMLTrack b) { return a.GetInterleaveIndex() < b.GetInterleaveIndex(); }

void AddAudioTracks(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml, bool hasIxml,
                    TimeCodeInfo start, unsigned long long sampleCount, int channels, double sampleRate,
                    unsigned int bitsPerSample, bool wrongEndian, bool floatingPoint, unsigned long long startPosition,
                    Movie& movie, _aafMobID_t* mobID, ITOVComponentFactory* factory, bool allowGrouping) {
    if (channels == 1 && allowGrouping) {
        std::vector<std::shared_ptr<Track>> tracks;
        auto groupLength = static_cast<long long>(sampleCount);
        if (GroupingFunctions::FindAndParseFilesForGrouping(movie.GetFilePath(), tracks, movie.GetMovieEditRate(),
                                                            groupLength, mobID, factory, movie)) {
            movie.SetMovieGroupLength(groupLength);
            movie.SetHasMovieGroupLength(true);
            AddAudioTracksFromMonophonicGroup(start, tracks, movie);
            return;
        }
    }
    AddAudioTracksFromMetadata(bext, hasBext, ixml, hasIxml, start, sampleCount, channels, sampleRate, bitsPerSample,
                               wrongEndian, floatingPoint, startPosition, movie);
}

void AddAudioTracksFromMetadata(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                                bool hasIxml, TimeCodeInfo start, unsigned long long sampleCount, int channels,
                                double sampleRate, unsigned int bitsPerSample, bool wrongEndian, bool floatingPoint,
                                unsigned long long startPosition, Movie& movie) {
    const unsigned int sampleBytes = (bitsPerSample + 7) / 8;
    const bool bigEndian = wrongEndian && HelperFunctions::IAmLittleEndian();
    unsigned long long offset = startPosition;
    const auto makeTrack = [&](unsigned char channelIndex) {
        auto descriptor = std::make_shared<AudioMediaDescriptor>(kAudioFormatPCM, sampleRate, sampleBytes * channels,
                                                                 sampleBytes * channels, channels, bitsPerSample,
                                                                 bigEndian, floatingPoint, offset);
        movie.AddTrack(std::make_shared<Track>(start, sampleBytes, sampleCount, channelIndex, descriptor));
        offset += sampleBytes;
    };

    const std::vector<IXMLTrack>& list = ixml.GetTracksList();
    const size_t expected = ixml.HasTracksCount() ? ixml.GetTracksCount() : static_cast<size_t>(channels);
    const bool useTrackList =
        hasIxml && ixml.HasTracksList() && !list.empty() && list.size() == expected && EveryEntryHasBothIndices(list);
    if (useTrackList) {
        const std::vector<IXMLTrack> sorted = SortedByInterleave(list);
        HelperFunctions::TrkMap trks;
        for (int i = 0; i < channels; ++i) {
            if (static_cast<size_t>(i) < sorted.size()) {
                const IXMLTrack& entry = sorted[i];
                // The channel index is cut to 8 bits: 300 becomes 44.
                makeTrack(static_cast<unsigned char>(entry.GetChannelIndex()));
                trks["TRK" + std::to_string(i + 1)] = entry.HasName() ? Chunks::IXML::UTF8Text(entry.GetName()) : "";
            } else {
                makeTrack(static_cast<unsigned char>(i));
            }
        }
        movie.SetMovieTRKs(trks);
        movie.SetHasMovieTRKs(true);
    } else {
        for (int i = 0; i < channels; ++i) makeTrack(static_cast<unsigned char>(i));
        if (hasBext && MergeBextTrkKeywords(bext, movie)) movie.SetHasMovieTRKs(true);
    }
    movie.SetIsMonoAudio(channels == 1);
}

void AddAudioTracksFromMonophonicGroup(TimeCodeInfo start, std::vector<std::shared_ptr<Track>> tracks, Movie& movie) {
    for (const auto& track : tracks) {
        track->GetMedia()->SetStartTimeCode(start);
        movie.AddTrack(track);
    }
    movie.SetIsMonophonicGroup(true);
}

void AddTrkFromMetadataMonophonic(const Chunks::BEXT::BEXTChunk* bext, bool, const Chunks::IXML::IXMLData& ixml,
                                  bool hasIxml, Movie& movie) {
    const std::vector<IXMLTrack>& list = ixml.GetTracksList();
    if (hasIxml && ixml.HasTracksList() && !list.empty()) {
        const size_t count = ixml.HasTracksCount() ? ixml.GetTracksCount() : 1;
        if (list.size() == count && EveryEntryHasBothIndices(list)) {
            const std::vector<IXMLTrack> sorted = SortedByInterleave(list);
            HelperFunctions::TrkMap trks = movie.GetMovieTRKs();
            for (size_t i = 0; i < count; ++i)
                trks["TRK" + std::to_string(sorted[i].GetChannelIndex())] = Chunks::IXML::UTF8Text(sorted[i].GetName());
            movie.SetMovieTRKs(trks);
            movie.SetHasMovieTRKs(true);
            return;
        }
    }
    // The caller passes the stream's `bext` object whether or not the chunk
    // was accepted; an unaccepted one has no keywords.
    movie.SetHasMovieTRKs(MergeBextTrkKeywords(bext, movie));
}

}  // namespace OrloReader
