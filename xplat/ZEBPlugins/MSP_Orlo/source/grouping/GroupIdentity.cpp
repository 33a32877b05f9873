#include "grouping/GroupIdentity.h"

#include "identity/GenerateUMIDFromData.h"

namespace Grouping {

GroupIdentity::~GroupIdentity() {
    _aafUID_t unused{};
    if (m_Digest != nullptr) ZEB::GenerateUMIDFromData_Finish(&m_Digest, &unused);
}

bool GroupIdentity::Open() { return ZEB::GenerateUMIDFromData_Begin(&m_Digest) >= 0; }

bool GroupIdentity::Write(const std::vector<std::shared_ptr<OrloReader::Track>>& tracks, _aafMobID_t& base) {
    for (const auto& track : tracks) {
        _aafUID_t material = track->GetUID();
        if (ZEB::GenerateUMIDFromData_AddData(&m_Digest, sizeof material, reinterpret_cast<unsigned char*>(&material)) <
            0)
            return false;
    }
    _aafUID_t digest{};
    if (ZEB::GenerateUMIDFromData_Finish(&m_Digest, &digest) < 0) return false;
    base.material = digest;
    return true;
}

}  // namespace Grouping
