#include "clipmodel/MobIDFromMetadata.h"

#include <sys/stat.h>

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <memory>

#include "boundary/OrloConstants.h"
#include "clipmodel/IsToggleOn.h"
#include "clipmodel/TextHelpers.h"
#include "identity/GenerateUMIDFromData.h"
#include "identity/GetMobIDFromString.h"
#include "reader/ixml/IXMLTextParsers.h"
#include "tov/TOVResult.h"

namespace OrloReader {

namespace {

// The constant head of every identity made here: a SMPTE UMID label for
// material of this kind, length 0x13, instance 0.
constexpr unsigned char kMobIDHead[16] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01,
                                          0x01, 0x01, 0x0F, 0x00, 0x13, 0x00, 0x00, 0x00};

// The first 32 characters of the FILE_UID, taken as bytes, become the whole
// ID. Letters are data here, not hex digits.
bool FromIxml(const Chunks::IXML::IXMLData& ixml, _aafMobID_t& mobID) {
    std::string uid = Chunks::IXML::UTF8Text(ixml.GetFileUID());
    if (uid.size() < 32) return false;
    uid.resize(32);
    const std::string dump = HelperFunctions::HexDumpFromMemory(uid.data(), 32);
    return ZEB::GetMobIDFromString(dump.c_str(), &mobID) >= 0;
}

bool FromBext(const Chunks::BEXT::BEXTChunk& bext, _aafMobID_t& mobID) {
    const std::string dump = HelperFunctions::HexDumpFromMemory(reinterpret_cast<const char*>(bext.GetUMID()), 32);
    if (ZEB::GetMobIDFromString(dump.c_str(), &mobID) < 0) return false;
    // The digits were read back field by field as numbers. Unless the toggle
    // says the file already holds the ID in AAF order, each field's bytes and
    // the outer instance bytes are turned around.
    if (!IsToggleOn(toggle_BigEndianSmpteIdInBEXTData)) {
        unsigned char* data1 = reinterpret_cast<unsigned char*>(&mobID.material.Data1);
        std::reverse(data1, data1 + 4);
        unsigned char* data2 = reinterpret_cast<unsigned char*>(&mobID.material.Data2);
        std::swap(data2[0], data2[1]);
        unsigned char* data3 = reinterpret_cast<unsigned char*>(&mobID.material.Data3);
        std::swap(data3[0], data3[1]);
        std::swap(mobID.instanceHigh, mobID.instanceLow);
    }
    return IsMobIdMaterialValid(mobID.material);
}

bool AllZero(const unsigned char* bytes, size_t count) {
    return std::all_of(bytes, bytes + count, [](unsigned char b) { return b == 0; });
}

struct FileCloser {
    void operator()(FILE* file) const { std::fclose(file); }
};

}  // namespace

bool IsMobIdMaterialValid(_aafUID_t material) {
    uint64_t data4 = 0;
    std::memcpy(&data4, material.Data4, sizeof data4);
    return material.Data1 != 0 && material.Data2 != 0 && material.Data3 != 0 && data4 != 0;
}

_aafMobID_t MobIDFromMetadata(const Chunks::BEXT::BEXTChunk* bext, bool hasBext, const Chunks::IXML::IXMLData& ixml,
                              bool hasIxml, const Chunks::UMID::UMIDChunk* umid, bool hasUmid,
                              const ZEB::ZEBString& path) {
    _aafMobID_t mobID{};
    std::memcpy(&mobID, kMobIDHead, sizeof kMobIDHead);

    if (IsToggleOn(toggle_MobIDFromiXML) && hasIxml && ixml.HasFileUID() && FromIxml(ixml, mobID)) return mobID;

    // Version 0 has no UMID field; the 64 bytes are compared as a whole.
    if (hasBext && bext != nullptr && bext->GetVersion() != 0 && !AllZero(bext->GetUMID(), 64) &&
        FromBext(*bext, mobID))
        return mobID;

    // A failed route above may have left its bytes in the head; only the
    // material is replaced from here on.
    if (hasUmid && umid != nullptr && umid->IsValid()) {
        _aafUID_t material{};
        std::memcpy(&material, umid->GetUMID() + 3, sizeof material);
        if (IsMobIdMaterialValid(material)) {
            mobID.material = material;
            return mobID;
        }
    }

    _aafUID_t material{};
    if (!GenerateUIDFromFile(path, material)) throw static_cast<int>(TOV_E_NOTSUPPORTED);
    if (IsMobIdMaterialValid(material)) mobID.material = material;
    return mobID;
}

bool GenerateUIDFromFile(ZEB::ZEBString path, _aafUID_t& uid) {
    if (path.IsEmpty()) return false;
    path.ConvertTo(kTOVUnicodeUTF8);
    std::vector<unsigned char> buffer;
    if (!GetBufferForHash(reinterpret_cast<const char*>(path.GetUTF8String()), buffer)) return false;
    void* digest = nullptr;
    const bool made =
        ZEB::GenerateUMIDFromData_Begin(&digest) == 0 &&
        ZEB::GenerateUMIDFromData_AddData(&digest, static_cast<unsigned int>(buffer.size()), buffer.data()) == 0 &&
        ZEB::GenerateUMIDFromData_Finish(&digest, &uid) == 0;
    // A digest left open by a failed step is finished only to free it.
    if (digest != nullptr) {
        _aafUID_t unused{};
        ZEB::GenerateUMIDFromData_Finish(&digest, &unused);
    }
    return made;
}

bool GetBufferForHash(const std::string& path, std::vector<unsigned char>& buffer) {
    buffer.clear();
    if (path.empty()) return false;
    std::unique_ptr<FILE, FileCloser> file(std::fopen(path.c_str(), "rb"));
    if (!file) return false;
    struct stat info {};
    if (fstat(fileno(file.get()), &info) != 0) return false;
    const long long size = info.st_size;

    // The largest multiple of 64 up to 4096 that fits three times into the
    // file with room to spare, or 64 at the least.
    long long n = 4096;
    while (!(size > 3 * n) && n != 64) n -= 64;

    const auto readBlock = [&]() {
        const size_t at = buffer.size();
        buffer.resize(at + static_cast<size_t>(n));
        return std::fread(buffer.data() + at, 1, static_cast<size_t>(n), file.get()) == static_cast<size_t>(n);
    };
    const bool ok = readBlock() && fseeko(file.get(), size / 2 - (3 * n) / 2, SEEK_CUR) == 0 && readBlock() &&
                    fseeko(file.get(), -n, SEEK_END) == 0 && readBlock();
    if (!ok) {
        buffer.clear();
        return false;
    }
    const std::string name = HelperFunctions::GetFullFileNameFromPath(path);
    buffer.insert(buffer.end(), name.begin(), name.end());
    return true;
}

}  // namespace OrloReader
