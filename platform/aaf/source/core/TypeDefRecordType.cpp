#include "TypeDefRecordType.h"

#include <cstring>

#include "Schema.h"
#include "WideText.h"

namespace aafmodel {

TypeDefRecordType::TypeDefRecordType(Schema& schema, const aafUID_t& id, std::wstring name)
    : TypeDefFace(schema, id, std::move(name), kAAFTypeCatRecord) {}

void TypeDefRecordType::AddMember(TypeDefinition& type, std::wstring name) {
    const size_t align = type.Alignment();
    const size_t unpadded = m_members.empty() ? 0 : m_members.back().offset + m_members.back().type->NativeSize();
    const size_t offset = (unpadded + align - 1) / align * align;
    m_members.push_back(Member{&type, std::move(name), offset});
    m_alignment = std::max(m_alignment, align);
    const size_t end = offset + type.NativeSize();
    m_size = (end + m_alignment - 1) / m_alignment * m_alignment;
}

void TypeDefRecordType::Layout(const std::vector<size_t>& offsets, size_t size) {
    if (offsets.size() != m_members.size()) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
    for (size_t i = 0; i < offsets.size(); ++i)
        if (offsets[i] + m_members[i].type->NativeSize() > size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
    for (size_t i = 0; i < offsets.size(); ++i) m_members[i].offset = offsets[i];
    m_size = size;
}

const TypeDefRecordType::Member& TypeDefRecordType::MemberAt(aafUInt32 index) const {
    if (index >= m_members.size()) throw static_cast<int>(AAFRESULT_BADINDEX);
    return m_members[index];
}

void TypeDefRecordType::PutMember(Value& record, aafUInt32 index, IAAFPropertyValue* pMember) const {
    const Member& member = MemberAt(index);
    const Value& value = member.type->ValueOf(pMember);
    if (value.data.size() != member.type->NativeSize()) throw static_cast<int>(AAFRESULT_BAD_TYPE);
    record.data.resize(m_size);
    std::memcpy(record.data.data() + member.offset, value.data.data(), value.data.size());
}

AAFRESULT TypeDefRecordType::Initialize(aafUID_constref id, IAAFTypeDef** ppMemberTypes, aafString_t* pMemberNames,
                                        aafUInt32 numMembers, aafCharacter_constptr pTypeName) {
    return Guarded([&] {
        Require(ppMemberTypes);
        Require(pMemberNames);
        if (Defined()) throw static_cast<int>(AAFRESULT_ALREADY_INITIALIZED);
        std::vector<TypeDefinition*> types;
        for (aafUInt32 i = 0; i < numMembers; ++i) {
            TypeDefinition* type = Borrow<TypeDefinition>(ppMemberTypes[i], kInternal_TypeDefinition);
            Require(type);
            Require(pMemberNames[i]);
            // A record holds plain data of fixed size only.
            if (type->NativeSize() == 0) throw static_cast<int>(AAFRESULT_BAD_TYPE);
            types.push_back(type);
        }
        Define(id, pTypeName);
        for (aafUInt32 i = 0; i < numMembers; ++i) AddMember(*types[i], pMemberNames[i]);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::GetMemberType(aafUInt32 index, IAAFTypeDef** ppTypeDef) {
    return Guarded([&] {
        Require(ppTypeDef);
        *ppTypeDef = MemberAt(index).type->Interface();
        (*ppTypeDef)->AddRef();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::GetMemberName(aafUInt32 index, aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyWide(MemberAt(index).name, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::GetMemberNameBufLen(aafUInt32 index, aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = WideBufLen(MemberAt(index).name);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::CreateValueFromValues(IAAFPropertyValue** pMemberValues, aafUInt32 numMembers,
                                                   IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(pMemberValues);
        Require(ppPropVal);
        if (numMembers != m_members.size()) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        Value value = EmptyValue();
        for (aafUInt32 i = 0; i < numMembers; ++i) PutMember(value, i, pMemberValues[i]);
        *ppPropVal = NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::CreateValueFromStruct(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                                   IAAFPropertyValue** ppPropVal) {
    return Guarded([&] {
        Require(pInitData);
        Require(ppPropVal);
        if (initDataSize != m_size || m_size == 0) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        Value value = EmptyValue();
        std::memcpy(value.data.data(), pInitData, m_size);
        *ppPropVal = NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::GetValue(IAAFPropertyValue* pInPropVal, aafUInt32 index,
                                      IAAFPropertyValue** ppOutPropVal) {
    return Guarded([&] {
        Require(ppOutPropVal);
        const Value& record = ValueOf(pInPropVal);
        const Member& member = MemberAt(index);
        if (record.data.size() != m_size) throw static_cast<int>(AAFRESULT_BAD_TYPE);
        Value value = member.type->EmptyValue();
        std::memcpy(value.data.data(), record.data.data() + member.offset, value.data.size());
        *ppOutPropVal = member.type->NewValue(std::move(value));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::GetStruct(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) {
    return Guarded([&] {
        Require(pData);
        const Value& record = ValueOf(pPropVal);
        if (dataSize != m_size || record.data.size() != m_size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        std::memcpy(pData, record.data.data(), m_size);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::SetValue(IAAFPropertyValue* pPropVal, aafUInt32 index, IAAFPropertyValue* pMemberPropVal) {
    return Guarded([&] {
        PutMember(ValueOf(pPropVal), index, pMemberPropVal);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::SetStruct(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) {
    return Guarded([&] {
        Require(pData);
        Value& record = ValueOf(pPropVal);
        if (dataSize != m_size) throw static_cast<int>(AAFRESULT_ILLEGAL_VALUE);
        record.data.assign(pData, pData + m_size);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TypeDefRecordType::GetCount(aafUInt32* pCount) {
    if (!pCount) return AAFRESULT_NULL_PARAM;
    *pCount = static_cast<aafUInt32>(m_members.size());
    return AAFRESULT_SUCCESS;
}

AAFRESULT TypeDefRecordType::RegisterMembers(aafUInt32* pOffsets, aafUInt32 numMembers, aafUInt32 structSize) {
    return Guarded([&] {
        Require(pOffsets);
        if (!Defined()) throw static_cast<int>(AAFRESULT_NOT_INITIALIZED);
        Layout(std::vector<size_t>(pOffsets, pOffsets + numMembers), structSize);
        if (m_schema.IsBuiltIn(*this)) m_schema.NoteChangedInPlace();
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
