#pragma once
/// Records: named members of their own types, laid out as a C struct. Until
/// RegisterMembers gives the caller's layout, members sit at their natural
/// alignment, as a C compiler would place them.
#include <string>
#include <vector>

#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefRecord.h"

namespace aafmodel {

class TypeDefRecordType final : public TypeDefFace<IAAFTypeDefRecord> {
public:
    struct Member {
        TypeDefinition* type;
        std::wstring name;
        size_t offset;
    };

    TypeDefRecordType(Schema& schema, const aafUID_t& id, std::wstring name);

    /// Adds a member at its natural place, for the built-in records.
    void AddMember(TypeDefinition& type, std::wstring name);
    /// Gives the members fixed offsets and the record a fixed size.
    void Layout(const std::vector<size_t>& offsets, size_t size);
    const std::vector<Member>& Members() const { return m_members; }

    size_t NativeSize() const override { return m_size; }
    size_t Alignment() const override { return m_alignment; }

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref id, IAAFTypeDef** ppMemberTypes, aafString_t* pMemberNames,
                         aafUInt32 numMembers, aafCharacter_constptr pTypeName) override;
    AAFRESULT GetMemberType(aafUInt32 index, IAAFTypeDef** ppTypeDef) override;
    AAFRESULT GetMemberName(aafUInt32 index, aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetMemberNameBufLen(aafUInt32 index, aafUInt32* pLen) override;
    AAFRESULT CreateValueFromValues(IAAFPropertyValue** pMemberValues, aafUInt32 numMembers,
                                    IAAFPropertyValue** ppPropVal) override;
    AAFRESULT CreateValueFromStruct(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                    IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetValue(IAAFPropertyValue* pInPropVal, aafUInt32 index, IAAFPropertyValue** ppOutPropVal) override;
    AAFRESULT GetStruct(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) override;
    AAFRESULT SetValue(IAAFPropertyValue* pPropVal, aafUInt32 index, IAAFPropertyValue* pMemberPropVal) override;
    AAFRESULT SetStruct(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) override;
    AAFRESULT GetCount(aafUInt32* pCount) override;
    AAFRESULT RegisterMembers(aafUInt32* pOffsets, aafUInt32 numMembers, aafUInt32 structSize) override;

private:
    const Member& MemberAt(aafUInt32 index) const;
    /// Copies a member's value into the record's bytes.
    void PutMember(Value& record, aafUInt32 index, IAAFPropertyValue* pMember) const;

    std::vector<Member> m_members;
    size_t m_size = 0;
    size_t m_alignment = 1;
};

}  // namespace aafmodel
