#include "SourceReferenceView.h"

#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

namespace {
void SetIDs(ModelObject& ref, const PropertyDefinition& def, aafUInt32 count, const aafUInt32* ids) {
    Require(ids || count == 0);
    ref.SetUInt32Array(def, ids, count);
}

void GetIDs(const ModelObject& ref, const PropertyDefinition& def, aafUInt32 count, aafUInt32* ids) {
    Require(ids);
    if (!ref.Find(def)) throw static_cast<int>(AAFRESULT_PROP_NOT_PRESENT);
    const std::vector<aafUInt32> values = ref.GetUInt32Array(def);
    if (count < values.size()) throw static_cast<int>(AAFRESULT_SMALLBUF);
    std::copy(values.begin(), values.end(), ids);
}

AAFRESULT CountIDs(const ModelObject& ref, const PropertyDefinition& def, aafUInt32* count) {
    if (!count) return AAFRESULT_NULL_PARAM;
    *count = static_cast<aafUInt32>(ref.GetUInt32Array(def).size());
    return AAFRESULT_SUCCESS;
}
}  // namespace

AAFRESULT SourceReferenceView::GetSourceID(aafMobID_t* pSourceID) {
    return Guarded([&] {
        Require(pSourceID);
        *pSourceID = m_object.GetRequired<aafMobID_t>(*Builtins(m_object).p.sourceRefSourceID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::SetSourceID(aafMobID_constref sourceID) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.sourceRefSourceID, sourceID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::GetSourceMobSlotID(aafSlotID_t* pMobSlotID) {
    return Guarded([&] {
        Require(pMobSlotID);
        *pMobSlotID = m_object.GetRequired<aafSlotID_t>(*Builtins(m_object).p.sourceRefSourceMobSlotID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::SetSourceMobSlotID(aafSlotID_t mobSlotID) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.sourceRefSourceMobSlotID, mobSlotID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::SetChannelIDs(aafUInt32 numberElements, aafUInt32* pChannelIDs) {
    return Guarded([&] {
        SetIDs(m_object, *Builtins(m_object).p.sourceRefChannelIDs, numberElements, pChannelIDs);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::GetChannelIDs(aafUInt32 numberElements, aafUInt32* pChannelIDs) {
    return Guarded([&] {
        GetIDs(m_object, *Builtins(m_object).p.sourceRefChannelIDs, numberElements, pChannelIDs);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::GetChannelIDsSize(aafUInt32* numberElements) {
    return CountIDs(m_object, *Builtins(m_object).p.sourceRefChannelIDs, numberElements);
}

AAFRESULT SourceReferenceView::SetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* pMonoSourceSlotIDs) {
    return Guarded([&] {
        SetIDs(m_object, *Builtins(m_object).p.sourceRefMonoSourceSlotIDs, numberElements, pMonoSourceSlotIDs);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::GetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* pMonoSourceSlotIDs) {
    return Guarded([&] {
        GetIDs(m_object, *Builtins(m_object).p.sourceRefMonoSourceSlotIDs, numberElements, pMonoSourceSlotIDs);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT SourceReferenceView::GetMonoSourceSlotIDsSize(aafUInt32* numberElements) {
    return CountIDs(m_object, *Builtins(m_object).p.sourceRefMonoSourceSlotIDs, numberElements);
}

}  // namespace aafmodel
