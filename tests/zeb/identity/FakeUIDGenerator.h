#pragma once
/// A stand-in for the host's UID generator that writes down every call, can be
/// told to fail each step, and finishes with a checksum of the bytes added.
#include <string>
#include <vector>

#include "tov/ITOVUIDGeneratorMD5.h"
#include "tov/sdk/CTOVUnknown.h"

/// What the generators did; one log for all of them, since the host makes
/// components through a plain creator function.
struct GeneratorLog {
    struct Added {
        unsigned int count;
        std::string head;  ///< up to the first 8 bytes
    };
    int begins = 0;
    int finishes = 0;
    int wrongContexts = 0;  ///< calls with a context that Begin did not give
    std::vector<Added> added;
    TOVRESULT beginResult = TOV_OK;
    TOVRESULT addResult = TOV_OK;
    TOVRESULT finishResult = TOV_OK;
};
GeneratorLog& TheGeneratorLog();

/// The UID that Finish writes for these bytes added in order.
_aafUID_t FakeUIDOf(const std::string& bytes);

class FakeUIDGenerator : public ITOVUIDGeneratorMD5, public CTOVUnknown {
public:
    explicit FakeUIDGenerator(ITOVUnknown* outer) : CTOVUnknown(outer) {}
    TOV_FORWARD_UNKNOWN

    TOVRESULT Begin(void** context) override;
    TOVRESULT AddData(void* context, unsigned char* data, unsigned int count) override;
    TOVRESULT Finish(_aafUID_t* result, void** context) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    unsigned long long m_Sum = 0;
    unsigned long long m_Bytes = 0;
};
