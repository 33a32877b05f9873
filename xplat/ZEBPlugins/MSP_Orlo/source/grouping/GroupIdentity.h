#pragma once
/// The identity of a group: the label part of one member's Mob ID, and a
/// material part digested from every member's material in the group's order.
#include <memory>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/Track.h"

namespace Grouping {

class GroupIdentity {
public:
    GroupIdentity() = default;
    /// Ends a digest that was opened and never written, so that a scan that
    /// stops early holds nothing.
    ~GroupIdentity();
    GroupIdentity(const GroupIdentity&) = delete;
    GroupIdentity& operator=(const GroupIdentity&) = delete;

    /// Starts the digest through the host's UID generator; false when it
    /// cannot be started.
    bool Open();
    /// Digests the 16-byte material of each track in order and writes the
    /// result over `base`'s material. False, with `base` as it was, when a
    /// step of the digest fails.
    bool Write(const std::vector<std::shared_ptr<OrloReader::Track>>& tracks, _aafMobID_t& base);

private:
    void* m_Digest = nullptr;
};

}  // namespace Grouping
