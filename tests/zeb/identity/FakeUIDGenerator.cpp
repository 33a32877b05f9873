#include "FakeUIDGenerator.h"

#include <algorithm>
#include <cstring>

#include "tov/sdk/TOVComponent.h"

namespace {

constexpr unsigned long long kFNVOffset = 14695981039346656037ull;

void Mix(unsigned long long& sum, const unsigned char* data, unsigned int count) {
    for (unsigned int i = 0; i < count; ++i) sum = (sum ^ data[i]) * 1099511628211ull;
}

_aafUID_t UIDFrom(unsigned long long sum, unsigned long long bytes) {
    _aafUID_t uid{};
    uid.Data1 = static_cast<aafUInt32>(bytes);
    uid.Data2 = 0xFA;
    uid.Data3 = 0xCE;
    std::memcpy(uid.Data4, &sum, sizeof uid.Data4);
    return uid;
}

}  // namespace

GeneratorLog& TheGeneratorLog() {
    static GeneratorLog log;
    return log;
}

_aafUID_t FakeUIDOf(const std::string& bytes) {
    unsigned long long sum = kFNVOffset;
    Mix(sum, reinterpret_cast<const unsigned char*>(bytes.data()), static_cast<unsigned int>(bytes.size()));
    return UIDFrom(sum, bytes.size());
}

TOVRESULT FakeUIDGenerator::Begin(void** context) {
    ++TheGeneratorLog().begins;
    m_Sum = kFNVOffset;
    m_Bytes = 0;
    *context = this;
    return TheGeneratorLog().beginResult;
}

TOVRESULT FakeUIDGenerator::AddData(void* context, unsigned char* data, unsigned int count) {
    GeneratorLog& log = TheGeneratorLog();
    if (context != this) ++log.wrongContexts;
    log.added.push_back({count, std::string(reinterpret_cast<const char*>(data), std::min(count, 8u))});
    Mix(m_Sum, data, count);
    m_Bytes += count;
    return log.addResult;
}

TOVRESULT FakeUIDGenerator::Finish(_aafUID_t* result, void** context) {
    GeneratorLog& log = TheGeneratorLog();
    ++log.finishes;
    if (*context != this) ++log.wrongContexts;
    *context = nullptr;
    *result = UIDFrom(m_Sum, m_Bytes);
    return log.finishResult;
}

TOVRESULT FakeUIDGenerator::InternalQueryInterface(const _tovUID& iid, void** out) {
    if (iid == IID_ITOVUIDGeneratorMD5) return TOVExpose<ITOVUIDGeneratorMD5>(this, out);
    return CTOVUnknown::InternalQueryInterface(iid, out);
}
