#pragma once
/// Integer types of 1, 2, 4 or 8 bytes; the character type is one of 4 bytes
/// in the character category.
#include "TypeDefFace.h"
#include "aaf/IAAFTypeDefInt.h"

namespace aafmodel {

class TypeDefInteger final : public TypeDefFace<IAAFTypeDefInt> {
public:
    TypeDefInteger(Schema& schema, const aafUID_t& id, std::wstring name, aafUInt8 size, bool isSigned,
                   eAAFTypeCategory_t category = kAAFTypeCatInt);

    size_t NativeSize() const override { return m_size; }
    size_t Alignment() const override { return m_size; }
    bool Signed() const { return m_signed; }
    /// The value's integer, sign-extended when the type is signed.
    aafInt64 Read(const Value& value) const;
    /// Stores `v` in the type's width; throws AAFRESULT_ILLEGAL_VALUE when it does not fit.
    void Write(Value& value, aafInt64 v) const;

    using MetaDefinitionBase::Initialize;
    AAFRESULT Initialize(aafUID_constref id, aafUInt8 intSize, aafBool isSigned,
                         aafCharacter_constptr pTypeName) override;
    AAFRESULT CreateValue(aafMemPtr_t pVal, aafUInt32 valSize, IAAFPropertyValue** ppPropVal) override;
    AAFRESULT GetInteger(IAAFPropertyValue* pPropVal, aafMemPtr_t pVal, aafUInt32 valSize) override;
    AAFRESULT SetInteger(IAAFPropertyValue* pPropVal, aafMemPtr_t pVal, aafUInt32 valSize) override;
    AAFRESULT GetSize(aafUInt32* pSize) override;
    AAFRESULT IsSigned(aafBool* pSigned) override;

private:
    aafUInt8 m_size;
    bool m_signed;
};

}  // namespace aafmodel
