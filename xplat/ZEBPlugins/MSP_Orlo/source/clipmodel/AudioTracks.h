#pragma once
/// How a file's channels become a Movie's audio tracks, and where their names
/// come from.
#include <memory>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/Movie.h"
#include "reader/BEXTChunk.h"
#include "reader/ixml/IXMLData.h"
#include "reader/ixml/IXMLTrack.h"
#include "tov/ITOVComponentFactory.h"

namespace OrloReader {

/// The audio tracks of the clip. A one-channel file, when `allowGrouping`
/// says so, first looks for the sibling files of its recording: a group
/// fills the Movie with its members' tracks and length, and replaces `mobID`
/// by the group's identity. Otherwise one track per channel of the file, in
/// file channel order.
void AddAudioTracks(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml, bool hasIxml,
                    TimeCodeInfo start, unsigned long long sampleCount, int channels, double sampleRate,
                    unsigned int bitsPerSample, bool wrongEndian, bool floatingPoint, unsigned long long startPosition,
                    Movie& movie, _aafMobID_t* mobID, ITOVComponentFactory* factory, bool allowGrouping);

/// One track per channel; channel indices and TRK names from the iXML track
/// list when it describes every channel, else channel i is index i.
void AddAudioTracksFromMetadata(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                                bool hasIxml, TimeCodeInfo start, unsigned long long sampleCount, int channels,
                                double sampleRate, unsigned int bitsPerSample, bool wrongEndian, bool floatingPoint,
                                unsigned long long startPosition, Movie& movie);

/// Appends a group's tracks, each starting at `start`, and marks the movie a group.
void AddAudioTracksFromMonophonicGroup(TimeCodeInfo start, std::vector<std::shared_ptr<Track>> tracks, Movie& movie);

/// The TRK name of one mono file of a group, keyed by its channel index.
void AddTrkFromMetadataMonophonic(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                                  bool hasIxml, Movie& movie);

/// True when a's interleave index is less than b's.
bool InterleaveIndexComparator(Chunks::IXML::IXMLTrack a, Chunks::IXML::IXMLTrack b);

}  // namespace OrloReader
