#include "AAFDescriptorExtensions.h"

#include <string>

#include "AAFComPtr.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace AAFUtils {

namespace {

void Check(AAFRESULT result) {
    if (AAFRESULT_FAILED(result)) throw static_cast<int>(result);
}

/// Reading through an empty pointer is a failure of the whole operation.
template <class T>
T* Use(const AAFComPtr<T>& p) {
    if (!p) throw "_rep";
    return p.get();
}

/// The bodies here return nothing: getting to the end is success.
template <class Body>
TOVRESULT Guarded(Body&& body) {
    return TOVGuarded([&] {
        body();
        return TOV_OK;
    });
}

template <class I, class From>
AAFComPtr<I> QueryOrThrow(From* from) {
    if (!from) throw static_cast<int>(TOV_E_POINTER);
    AAFComPtr<I> out;
    Check(from->QueryInterface(AAFInterfaceID<I>::value, reinterpret_cast<void**>(out.out())));
    return out;
}

/// Steps 4 to 6 of every setter: find (or register) the optional property on
/// the class and set `value` on the object.
void PutProperty(IAAFDictionary* dictionary, IUnknown* target, const aafUID_t& classId, const aafUID_t& propertyId,
                 const wchar_t* name, IAAFTypeDef* type, IAAFPropertyValue* value) {
    AAFComPtr<IAAFClassDef> cls;
    Check(dictionary->LookupClassDef(classId, cls.out()));
    AAFComPtr<IAAFPropertyDef> property;
    if (AAFRESULT_FAILED(Use(cls)->LookupPropertyDef(propertyId, property.out())))
        Check(cls->RegisterOptionalPropertyDef(propertyId, name, type, property.out()));
    auto object = QueryOrThrow<IAAFObject>(target);
    Check(object->SetPropertyValue(Use(property), value));
}

AAFComPtr<IAAFTypeDef> LookupType(IAAFDictionary* dictionary, const aafUID_t& typeId) {
    if (!dictionary) throw static_cast<int>(TOV_E_POINTER);
    AAFComPtr<IAAFTypeDef> type;
    Check(dictionary->LookupTypeDef(typeId, type.out()));
    return type;
}

/// A record value from the bytes of `data`.
template <class T>
AAFComPtr<IAAFPropertyValue> RecordValue(IAAFTypeDef* type, const T& data) {
    auto record = QueryOrThrow<IAAFTypeDefRecord>(type);
    AAFComPtr<IAAFPropertyValue> value;
    T copy = data;
    Check(record->CreateValueFromStruct(reinterpret_cast<aafMemPtr_t>(&copy), sizeof copy, value.out()));
    return value;
}

TOVRESULT SetGUIDProperty(IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor, const _tovUID& id,
                          const aafUID_t& propertyId, const wchar_t* name) {
    return Guarded([&] {
        auto type = LookupType(dictionary, kAAFTypeID_AUID);
        auto value = RecordValue(type.get(), id);
        PutProperty(dictionary, descriptor, AUID_AAFEssenceDescriptor, propertyId, name, type.get(), value.get());
    });
}

}  // namespace

TOVRESULT SetMediaContainerGUID(IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor, _tovUID id) {
    return SetGUIDProperty(dictionary, descriptor, id, kAAFPropID_MediaContainerGUID, L"MediaContainerGUID");
}

TOVRESULT SetContainerHandlerGUID(IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor, _tovUID id) {
    return SetGUIDProperty(dictionary, descriptor, id, kAAFPropID_ContainerHandlerGUID, L"ContainerHandlerGUID");
}

TOVRESULT SetMediaAccessKind(IAAFDictionary* dictionary, IAAFFileDescriptor* descriptor, unsigned int kind) {
    return Guarded([&] {
        auto type = LookupType(dictionary, kAAFTypeID_UInt32);
        auto integer = QueryOrThrow<IAAFTypeDefInt>(type.get());
        AAFComPtr<IAAFPropertyValue> value;
        aafUInt32 raw = kind;
        Check(integer->CreateValue(reinterpret_cast<aafMemPtr_t>(&raw), sizeof raw, value.out()));
        PutProperty(dictionary, descriptor, AUID_AAFFileDescriptor, kAAFPropID_MediaAccessKind, L"MediaAccessKind",
                    type.get(), value.get());
    });
}

TOVRESULT SetBufferFillOrder(IAAFDictionary* dictionary, IAAFDigitalImageDescriptor* descriptor, int order) {
    return Guarded([&] {
        auto type = LookupType(dictionary, kAAFTypeID_ScanningDirectionType);
        auto enumeration = QueryOrThrow<IAAFTypeDefEnum>(type.get());
        aafUInt32 size = 0;
        Check(enumeration->GetNameBufLenFromInteger(order, &size));
        std::wstring name(size / sizeof(aafCharacter), L'\0');
        Check(enumeration->GetNameFromInteger(order, name.data(), size));
        AAFComPtr<IAAFPropertyValue> value;
        Check(enumeration->CreateValueFromName(name.c_str(), value.out()));
        PutProperty(dictionary, descriptor, AUID_AAFDigitalImageDescriptor,
                    kAAFPropID_DigitalImageDescriptor_BufferFillOrder, L"BufferFillOrder", type.get(), value.get());
    });
}

TOVRESULT SetImageRotation(IAAFDictionary* dictionary, IAAFDigitalImageDescriptor* descriptor,
                           _aafRational_t rotation) {
    return Guarded([&] {
        auto type = LookupType(dictionary, kAAFTypeID_Rational);
        auto value = RecordValue(type.get(), rotation);
        PutProperty(dictionary, descriptor, AUID_AAFDigitalImageDescriptor,
                    kAAFPropID_DigitalImageDescriptor_ImageRotation, L"ImageRotation", type.get(), value.get());
    });
}

TOVRESULT InsertSequenceToTimelineMobSlot(IAAFDictionary* dictionary, IAAFMobSlot* slot) {
    return Guarded([&] {
        if (!dictionary || !slot) throw static_cast<int>(TOV_E_POINTER);
        AAFComPtr<IAAFSegment> segment;
        Check(slot->GetSegment(segment.out()));
        AAFComPtr<IAAFSequence> existing;
        if (AAFRESULT_SUCCEEDED(
                Use(segment)->QueryInterface(IID_IAAFSequence, reinterpret_cast<void**>(existing.out()))))
            return;
        AAFComPtr<IAAFClassDef> cls;
        if (AAFRESULT_FAILED(dictionary->LookupClassDef(AUID_AAFSequence, cls.out()))) throw "AAFRESULT_SUCCEEDED (hr)";
        AAFComPtr<IAAFSequence> sequence;
        Check(cls->CreateInstance(IID_IAAFSequence, reinterpret_cast<IUnknown**>(sequence.out())));
        auto component = QueryOrThrow<IAAFComponent>(segment.get());
        AAFComPtr<IAAFDataDef> dataDef;
        Check(component->GetDataDef(dataDef.out()));
        Check(Use(sequence)->Initialize(dataDef.get()));
        auto sequenceSegment = QueryOrThrow<IAAFSegment>(sequence.get());
        // The old segment leaves the slot before it enters the sequence.
        Check(slot->SetSegment(sequenceSegment.get()));
        Check(sequence->AppendComponent(component.get()));
    });
}

_aafUID_t GetAAFClassID(IAAFObject* object) {
    constexpr int kUnexpected = static_cast<int>(TOV_E_UNEXPECTED);
    try {
        AAFComPtr<IAAFDictionary> dictionary;
        if (AAFRESULT_SUCCEEDED(object->QueryInterface(IID_IAAFDictionary, reinterpret_cast<void**>(dictionary.out()))))
            throw kUnexpected;
        AAFComPtr<IAAFClassDef> cls;
        Check(object->GetDefinition(cls.out()));
        auto meta = QueryOrThrow<IAAFMetaDefinition>(Use(cls));
        _aafUID_t id;
        Check(meta->GetAUID(&id));
        return id;
    } catch (...) {
        throw kUnexpected;
    }
}

TOVRESULT RegisterOrrinBoundsBoxTypeMembers(IAAFTypeDef* typeDef) {
    return Guarded([&] {
        auto record = QueryOrThrow<IAAFTypeDefRecord>(typeDef);
        aafUInt32 offsets[4] = {0, 8, 16, 24};
        Check(record->RegisterMembers(offsets, 4, sizeof(aafBoundsBox_t)));
    });
}

TOVRESULT InitializeOrrinBoundsBoxType(IAAFDictionary* dictionary, IAAFTypeDef* typeDef) {
    return Guarded([&] {
        auto rational = LookupType(dictionary, kAAFTypeID_Rational);
        IAAFTypeDef* types[4] = {rational.get(), rational.get(), rational.get(), rational.get()};
        aafCharacter positionX[] = L"PositionX", positionY[] = L"PositionY", width[] = L"Width", height[] = L"Height";
        aafString_t names[4] = {positionX, positionY, width, height};
        auto record = QueryOrThrow<IAAFTypeDefRecord>(typeDef);
        Check(record->Initialize(kAAFTypeID_OrrinBoundsBox, types, names, 4, L"BoundsBox"));
    });
}

namespace {
TOVRESULT PutBoxToAAF(const aafUID_t& propertyId, const wchar_t* name, IAAFClassDef* cls, IAAFTypeDef* type,
                      IAAFDigitalImageDescriptor* descriptor, aafBoundsBox_t& box) {
    return Guarded([&] {
        auto value = RecordValue(type, box);
        AAFComPtr<IAAFPropertyDef> property;
        if (AAFRESULT_FAILED(cls->LookupPropertyDef(propertyId, property.out())))
            Check(cls->RegisterOptionalPropertyDef(propertyId, name, type, property.out()));
        auto object = QueryOrThrow<IAAFObject>(descriptor);
        Check(object->SetPropertyValue(Use(property), value.get()));
    });
}
}  // namespace

TOVRESULT PutBoxesToAAF(IAAFDictionary* dictionary, IAAFDigitalImageDescriptor* descriptor, aafBoundsBox_t& essenceBox,
                        aafBoundsBox_t& sourceBox, aafBoundsBox_t& validBox) {
    return Guarded([&] {
        if (!dictionary) throw static_cast<int>(TOV_E_POINTER);
        AAFComPtr<IAAFTypeDef> type;
        if (AAFRESULT_FAILED(dictionary->LookupTypeDef(kAAFTypeID_OrrinBoundsBox, type.out()))) {
            AAFComPtr<IAAFTypeDefRecord> record;
            Check(dictionary->CreateMetaInstance(AUID_AAFTypeDefinitionRecord, IID_IAAFTypeDefRecord,
                                                 reinterpret_cast<IUnknown**>(record.out())));
            type = QueryOrThrow<IAAFTypeDef>(Use(record));
            Check(InitializeOrrinBoundsBoxType(dictionary, type.get()));
            Check(dictionary->RegisterTypeDef(type.get()));
            Check(RegisterOrrinBoundsBoxTypeMembers(type.get()));
        }
        AAFComPtr<IAAFClassDef> cls;
        Check(dictionary->LookupClassDef(AUID_AAFDigitalImageDescriptor, cls.out()));
        Check(PutBoxToAAF(kAAFPropID_EssenceBox, L"EssenceBox", Use(cls), type.get(), descriptor, essenceBox));
        Check(PutBoxToAAF(kAAFPropID_SourceBox, L"SourceBox", cls.get(), type.get(), descriptor, sourceBox));
        Check(PutBoxToAAF(kAAFPropID_ValidBox, L"ValidBox", cls.get(), type.get(), descriptor, validBox));
    });
}

aafBoundsBox_t ToAAFBox(_aafRational_t positionX, _aafRational_t positionY, _aafRational_t width,
                        _aafRational_t height) {
    return aafBoundsBox_t{positionX, positionY, width, height};
}

}  // namespace AAFUtils
}  // namespace ZEB
