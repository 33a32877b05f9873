#include "reader/PerformAdditionalInitialization.h"

#include "reader/COMMChunk.h"
#include "reader/DATAChunk.h"
#include "reader/FMTChunk.h"
#include "reader/OrloStream.h"
#include "reader/SSNDChunk.h"

namespace Orlo {

void PerformAdditionalInitialization(OrloStream& stream, unsigned int type) {
    switch (type) {
        case OrloStream::DATA_CHUNK: {
            const auto fmt = stream.GetChunk<Chunks::FMT::FMTChunk>();
            const auto data = stream.GetChunk<Chunks::DATA::DATAChunk>();
            data->CalculateSampleSizeAndCount(fmt->GetBitsPerSample(), fmt->GetChannelCount());
            data->SetDataWrongEndian(stream.IsFileWrongEndian());
            break;
        }
        case OrloStream::COMM_CHUNK: {
            // "sowt" is AIFF-C's little-endian PCM: the samples run the other
            // way from the chunk integers.
            const auto comm = stream.GetChunk<Chunks::COMM::COMMChunk>();
            const bool sowt = comm->GetCompressionType() == Chunks::COMM::kSowt;
            comm->SetDataWrongEndian(sowt ? !stream.IsFileWrongEndian() : stream.IsFileWrongEndian());
            break;
        }
        case OrloStream::SSND_CHUNK:
            stream.GetChunk<Chunks::SSND::SSNDChunk>()->CalculateSampleSize(
                stream.GetChunk<Chunks::COMM::COMMChunk>()->GetBitsPerSample());
            break;
        default:
            break;
    }
}

}  // namespace Orlo
