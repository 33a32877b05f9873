#include "AAFTreeReader.h"

#include <cstdio>
#include <string>
#include <vector>

#include "AAFComPtr.h"
#include "identity/IDText.h"
#include "strings/UTFConversions.h"

namespace ZEB {

using AAFUtils::AAFComPtr;

namespace {

void Check(AAFRESULT result) {
    if (AAFRESULT_FAILED(result)) throw static_cast<int>(result);
}

/// The name of anything with GetNameBufLen and GetName.
template <class Named>
std::string NameOf(Named* named) {
    aafUInt32 size = 0;
    Check(named->GetNameBufLen(&size));
    std::vector<aafCharacter> buffer(size / sizeof(aafCharacter) + 1, 0);
    Check(named->GetName(buffer.data(), static_cast<aafUInt32>(buffer.size() * sizeof(aafCharacter))));
    return wToUTF8(buffer.data());
}

/// The text form of the identifier sheet: {Data1-Data2-Data3-Data4[0..1]-Data4[2..7]}.
std::string UIDText(const aafUID_t& id) { return "{" + GUIDText(id, HexCase::Upper) + "}"; }

/// A Mob ID in the SMPTE URN form of a UMID.
std::string MobIDText(const aafMobID_t& id) {
    std::string text = MobIDDigits(id, HexCase::Lower);
    for (int at : {48, 44, 40, 32, 24, 16, 8}) text.insert(static_cast<size_t>(at), 1, '.');
    return "urn:smpte:umid:" + text;
}

aafUID_t TypeID(IAAFTypeDef* type) {
    AAFComPtr<IAAFMetaDefinition> meta;
    Check(type->QueryInterface(IID_IAAFMetaDefinition, reinterpret_cast<void**>(meta.out())));
    aafUID_t id;
    Check(meta->GetAUID(&id));
    return id;
}

AAFDumpNode Leaf(AAFDumpNode::Kind kind, std::string value) {
    AAFDumpNode node;
    node.kind = kind;
    node.value = std::move(value);
    return node;
}

template <class I>
AAFComPtr<I> Face(IAAFTypeDef* type) {
    AAFComPtr<I> face;
    Check(type->QueryInterface(AAFInterfaceID<I>::value, reinterpret_cast<void**>(face.out())));
    return face;
}

}  // namespace

AAFDumpNode AAFTreeReader::ReadObject(IAAFObject* object) {
    AAFComPtr<IAAFClassDef> cls;
    Check(object->GetDefinition(cls.out()));
    AAFDumpNode node = Leaf(AAFDumpNode::Kind::Object, NameOf(cls.get()));
    AAFComPtr<IEnumAAFProperties> properties;
    Check(object->GetProperties(properties.out()));
    AAFComPtr<IAAFProperty> property;
    while (AAFRESULT_SUCCEEDED(properties->NextOne(property.out()))) {
        AAFComPtr<IAAFPropertyDef> def;
        Check(property->GetDefinition(def.out()));
        AAFComPtr<IAAFTypeDef> type;
        Check(def->GetTypeDef(type.out()));
        if (m_omitClock && TypeID(type.get()) == kAAFTypeID_TimeStamp) continue;
        AAFComPtr<IAAFPropertyValue> value;
        Check(property->GetValue(value.out()));
        node.fields.emplace_back(NameOf(def.get()), ReadValue(type.get(), value.get()));
    }
    return node;
}

AAFDumpNode AAFTreeReader::ReadValue(IAAFTypeDef* type, IAAFPropertyValue* value) {
    eAAFTypeCategory_t category = kAAFTypeCatUnknown;
    Check(type->GetTypeCategory(&category));
    switch (category) {
        case kAAFTypeCatInt:
        case kAAFTypeCatCharacter: {
            auto integer = Face<IAAFTypeDefInt>(type);
            aafUInt32 size = 0;
            aafBool isSigned = kAAFFalse;
            Check(integer->GetSize(&size));
            Check(integer->IsSigned(&isSigned));
            aafUInt8 bytes[8] = {};
            Check(integer->GetInteger(value, bytes, size));
            uint64_t raw = 0;
            for (aafUInt32 i = 0; i < size; ++i) raw |= uint64_t(bytes[i]) << (8 * i);  // little-endian host
            if (isSigned && size < 8 && (raw >> (size * 8 - 1)) & 1) raw |= ~0ull << (size * 8);
            return Leaf(AAFDumpNode::Kind::Number,
                        isSigned ? std::to_string(static_cast<int64_t>(raw)) : std::to_string(raw));
        }
        case kAAFTypeCatEnum: {
            auto enumeration = Face<IAAFTypeDefEnum>(type);
            aafUInt32 size = 0;
            if (AAFRESULT_SUCCEEDED(enumeration->GetNameBufLenFromValue(value, &size))) {
                std::vector<aafCharacter> name(size / sizeof(aafCharacter) + 1, 0);
                Check(enumeration->GetNameFromValue(value, name.data(), size));
                return Leaf(AAFDumpNode::Kind::Text, wToUTF8(name.data()));
            }
            aafInt64 number = 0;
            Check(enumeration->GetIntegerValue(value, &number));
            return Leaf(AAFDumpNode::Kind::Number, std::to_string(number));
        }
        case kAAFTypeCatRecord:
            return ReadRecord(type, value);
        case kAAFTypeCatString: {
            auto text = Face<IAAFTypeDefString>(type);
            aafUInt32 count = 0;
            Check(text->GetCount(value, &count));
            std::vector<aafCharacter> chars(count + 1, 0);
            if (count)
                Check(text->GetElements(value, reinterpret_cast<aafMemPtr_t>(chars.data()),
                                        static_cast<aafUInt32>(count * sizeof(aafCharacter))));
            return Leaf(AAFDumpNode::Kind::Text, wToUTF8(chars.data()));
        }
        case kAAFTypeCatStrongObjRef: {
            AAFComPtr<IAAFObject> object;
            Check(Face<IAAFTypeDefObjectRef>(type)->GetObject(value, IID_IAAFObject,
                                                              reinterpret_cast<IUnknown**>(object.out())));
            return ReadObject(object.get());
        }
        case kAAFTypeCatWeakObjRef: {
            AAFComPtr<IAAFDefObject> target;
            Check(Face<IAAFTypeDefObjectRef>(type)->GetObject(value, IID_IAAFDefObject,
                                                              reinterpret_cast<IUnknown**>(target.out())));
            aafUID_t id;
            Check(target->GetAUID(&id));
            return Leaf(AAFDumpNode::Kind::Text, NameOf(target.get()) + " " + UIDText(id));
        }
        case kAAFTypeCatVariableArray:
            return ReadArray(type, value);
        case kAAFTypeCatIndirect: {
            auto indirect = Face<IAAFTypeDefIndirect>(type);
            AAFComPtr<IAAFTypeDef> actualType;
            Check(indirect->GetActualType(value, actualType.out()));
            AAFComPtr<IAAFPropertyValue> actual;
            Check(indirect->GetActualValue(value, actual.out()));
            return ReadValue(actualType.get(), actual.get());
        }
        default:
            return Leaf(AAFDumpNode::Kind::Text, "<unreadable value>");
    }
}

// Identifiers, rationals and time stamps read as one value each; other
// records member by member.
AAFDumpNode AAFTreeReader::ReadRecord(IAAFTypeDef* type, IAAFPropertyValue* value) {
    auto record = Face<IAAFTypeDefRecord>(type);
    const aafUID_t id = TypeID(type);
    if (id == kAAFTypeID_AUID) {
        aafUID_t uid;
        Check(record->GetStruct(value, reinterpret_cast<aafMemPtr_t>(&uid), sizeof uid));
        return Leaf(AAFDumpNode::Kind::Text, UIDText(uid));
    }
    if (id == kAAFTypeID_MobIDType) {
        aafMobID_t mobID;
        Check(record->GetStruct(value, reinterpret_cast<aafMemPtr_t>(&mobID), sizeof mobID));
        return Leaf(AAFDumpNode::Kind::Text, MobIDText(mobID));
    }
    if (id == kAAFTypeID_Rational) {
        aafRational_t rational;
        Check(record->GetStruct(value, reinterpret_cast<aafMemPtr_t>(&rational), sizeof rational));
        return Leaf(AAFDumpNode::Kind::Text,
                    std::to_string(rational.numerator) + "/" + std::to_string(rational.denominator));
    }
    if (id == kAAFTypeID_TimeStamp) {
        aafTimeStamp_t stamp;
        Check(record->GetStruct(value, reinterpret_cast<aafMemPtr_t>(&stamp), sizeof stamp));
        char text[40];
        std::snprintf(text, sizeof text, "%04d-%02u-%02u %02u:%02u:%02u.%02u", stamp.date.year, stamp.date.month,
                      stamp.date.day, stamp.time.hour, stamp.time.minute, stamp.time.second, stamp.time.fraction);
        return Leaf(AAFDumpNode::Kind::Text, text);
    }
    AAFDumpNode node;
    node.kind = AAFDumpNode::Kind::Record;
    aafUInt32 count = 0;
    Check(record->GetCount(&count));
    for (aafUInt32 i = 0; i < count; ++i) {
        aafUInt32 size = 0;
        Check(record->GetMemberNameBufLen(i, &size));
        std::vector<aafCharacter> name(size / sizeof(aafCharacter) + 1, 0);
        Check(record->GetMemberName(i, name.data(), size));
        AAFComPtr<IAAFTypeDef> memberType;
        Check(record->GetMemberType(i, memberType.out()));
        AAFComPtr<IAAFPropertyValue> member;
        Check(record->GetValue(value, i, member.out()));
        node.fields.emplace_back(wToUTF8(name.data()), ReadValue(memberType.get(), member.get()));
    }
    return node;
}

// Arrays of bytes read as one hexadecimal text; others element by element.
AAFDumpNode AAFTreeReader::ReadArray(IAAFTypeDef* type, IAAFPropertyValue* value) {
    auto array = Face<IAAFTypeDefVariableArray>(type);
    AAFComPtr<IAAFTypeDef> elementType;
    Check(array->GetType(elementType.out()));
    aafUInt32 count = 0;
    Check(array->GetCount(value, &count));
    if (TypeID(elementType.get()) == kAAFTypeID_UInt8) {
        std::vector<aafUInt8> bytes(count);
        if (count) Check(array->GetCArray(value, bytes.data(), count));
        return Leaf(AAFDumpNode::Kind::Text, HexText(bytes.data(), bytes.size(), HexCase::Lower));
    }
    AAFDumpNode node;
    node.kind = AAFDumpNode::Kind::List;
    for (aafUInt32 i = 0; i < count; ++i) {
        AAFComPtr<IAAFPropertyValue> element;
        Check(array->GetElementValue(value, i, element.out()));
        node.items.push_back(ReadValue(elementType.get(), element.get()));
    }
    return node;
}

}  // namespace ZEB
