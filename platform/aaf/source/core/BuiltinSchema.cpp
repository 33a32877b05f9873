#include "BuiltinSchema.h"

#include <cstddef>

#include "../views/CommentMarkerView.h"
#include "../views/ComponentView.h"
#include "../views/ContentStorageView.h"
#include "../views/DescriptiveMarkerView.h"
#include "../views/DictionaryView.h"
#include "../views/DigitalImageDescriptorView.h"
#include "../views/EssenceDescriptorView.h"
#include "../views/EventMobSlotView.h"
#include "../views/EventView.h"
#include "../views/FileDescriptorView.h"
#include "../views/FillerView.h"
#include "../views/HeaderView.h"
#include "../views/IdentificationView.h"
#include "../views/ImportDescriptorView.h"
#include "../views/LocatorView.h"
#include "../views/MasterMobView.h"
#include "../views/MobSlotView.h"
#include "../views/MobView.h"
#include "../views/MultipleDescriptorView.h"
#include "../views/NetworkLocatorView.h"
#include "../views/ObjectView.h"
#include "../views/PCMDescriptorView.h"
#include "../views/SegmentView.h"
#include "../views/SequenceView.h"
#include "../views/SoundDescriptorView.h"
#include "../views/SourceClipView.h"
#include "../views/SourceMobView.h"
#include "../views/SourceReferenceView.h"
#include "../views/TaggedValueView.h"
#include "../views/TapeDescriptorView.h"
#include "../views/TimecodeView.h"
#include "../views/TimelineMobSlotView.h"
#include "ClassDefinition.h"
#include "DataDefinition.h"
#include "PropertyDefinition.h"
#include "Schema.h"
#include "TypeDefEnumeration.h"
#include "TypeDefFixedArrayType.h"
#include "TypeDefIndirectType.h"
#include "TypeDefInteger.h"
#include "TypeDefRecordType.h"
#include "TypeDefStringType.h"
#include "TypeDefStrongReference.h"
#include "TypeDefVariableArrayType.h"
#include "TypeDefWeakReference.h"
#include "ViewBase.h"
#include "aaf/AAFClassDefUIDs.h"
#include "aaf/AAFDataDefs.h"
#include "aaf/AAFPropertyDefs.h"
#include "aaf/AAFTypeDefUIDs.h"

namespace aafmodel {

namespace {

class Builder {
public:
    explicit Builder(Schema& s) : m_s(s), m_b(s.MutableBuiltins()) {}

    void Run() {
        Types();
        Classes();
        Properties();
        References();
        DataDefinitions();
    }

private:
    template <class T, class... Args>
    T* Type(Args&&... args) {
        auto* def = static_cast<T*>(m_s.Own(std::make_unique<T>(m_s, std::forward<Args>(args)...)));
        m_s.Register(*def);
        return def;
    }
    TypeDefInteger* Int(const aafUID_t& id, const wchar_t* name, aafUInt8 size, bool isSigned) {
        return Type<TypeDefInteger>(id, name, size, isSigned);
    }
    TypeDefRecordType* Record(const aafUID_t& id, const wchar_t* name,
                              std::initializer_list<std::pair<TypeDefinition*, const wchar_t*>> members,
                              std::initializer_list<size_t> offsets, size_t size) {
        auto* record = Type<TypeDefRecordType>(id, name);
        for (const auto& m : members) record->AddMember(*m.first, m.second);
        record->Layout(std::vector<size_t>(offsets), size);  // the layout of our own C records
        return record;
    }
    ClassDefinition* Class(const aafUID_t& id, const wchar_t* name, ClassDefinition* parent, bool concrete) {
        ClassDefinition* def = m_s.Own(std::make_unique<ClassDefinition>(m_s, id, name, parent, concrete));
        m_s.Register(*def);
        return def;
    }
    PropertyDefinition* Prop(ClassDefinition* cls, const aafUID_t& id, const wchar_t* name, TypeDefinition* type,
                             bool optional) {
        return cls->AddProperty(id, name, *type, optional);
    }
    TypeDefinition* Strong(const aafUID_t& id, const wchar_t* name, ClassDefinition* target) {
        return Type<TypeDefStrongReference>(id, name, target);
    }
    TypeDefinition* Vector(const aafUID_t& id, const wchar_t* name, TypeDefinition* element) {
        return Type<TypeDefVariableArrayType>(id, name, *element);
    }

    void Types() {
        auto& t = m_b.t;
        t.uint8 = Int(kAAFTypeID_UInt8, L"UInt8", 1, false);
        t.uint16 = Int(kAAFTypeID_UInt16, L"UInt16", 2, false);
        t.uint32 = Int(kAAFTypeID_UInt32, L"UInt32", 4, false);
        t.uint64 = Int(kAAFTypeID_UInt64, L"UInt64", 8, false);
        t.int8 = Int(kAAFTypeID_Int8, L"Int8", 1, true);
        t.int16 = Int(kAAFTypeID_Int16, L"Int16", 2, true);
        t.int32 = Int(kAAFTypeID_Int32, L"Int32", 4, true);
        t.int64 = Int(kAAFTypeID_Int64, L"Int64", 8, true);
        t.position = Int(kAAFTypeID_PositionType, L"PositionType", 8, true);
        t.length = Int(kAAFTypeID_LengthType, L"LengthType", 8, true);
        auto* int32 = static_cast<TypeDefInteger*>(t.int32);
        auto* uint8 = static_cast<TypeDefInteger*>(t.uint8);
        // In memory a Boolean is an aafBool, 32 bits wide.
        t.boolean = Type<TypeDefEnumeration>(kAAFTypeID_Boolean, L"Boolean", int32,
                                             std::vector<TypeDefEnumeration::Element>{{L"False", 0}, {L"True", 1}});
        t.character = Type<TypeDefInteger>(kAAFTypeID_Character, L"Character", aafUInt8(sizeof(aafCharacter)), false,
                                           kAAFTypeCatCharacter);
        t.string = Type<TypeDefStringType>(kAAFTypeID_String, L"String", t.character);
        auto* bytes8 = Type<TypeDefFixedArrayType>(kAAFTypeID_UInt8Array8, L"UInt8Array8", *t.uint8, 8);
        auto* bytes12 = Type<TypeDefFixedArrayType>(kAAFTypeID_UInt8Array12, L"UInt8Array12", *t.uint8, 12);
        t.auid = Record(kAAFTypeID_AUID, L"AUID",
                        {{t.uint32, L"Data1"}, {t.uint16, L"Data2"}, {t.uint16, L"Data3"}, {bytes8, L"Data4"}},
                        {offsetof(aafUID_t, Data1), offsetof(aafUID_t, Data2), offsetof(aafUID_t, Data3),
                         offsetof(aafUID_t, Data4)},
                        sizeof(aafUID_t));
        t.mobID = Record(
            kAAFTypeID_MobIDType, L"MobIDType",
            {{bytes12, L"SMPTELabel"},
             {t.uint8, L"length"},
             {t.uint8, L"instanceHigh"},
             {t.uint8, L"instanceMid"},
             {t.uint8, L"instanceLow"},
             {t.auid, L"material"}},
            {offsetof(aafMobID_t, SMPTELabel), offsetof(aafMobID_t, length), offsetof(aafMobID_t, instanceHigh),
             offsetof(aafMobID_t, instanceMid), offsetof(aafMobID_t, instanceLow), offsetof(aafMobID_t, material)},
            sizeof(aafMobID_t));
        t.rational =
            Record(kAAFTypeID_Rational, L"Rational", {{t.int32, L"Numerator"}, {t.int32, L"Denominator"}},
                   {offsetof(aafRational_t, numerator), offsetof(aafRational_t, denominator)}, sizeof(aafRational_t));
        auto* date =
            Record(kAAFTypeID_DateStruct, L"DateStruct", {{t.int16, L"year"}, {t.uint8, L"month"}, {t.uint8, L"day"}},
                   {offsetof(aafDateStruct_t, year), offsetof(aafDateStruct_t, month), offsetof(aafDateStruct_t, day)},
                   sizeof(aafDateStruct_t));
        auto* time = Record(kAAFTypeID_TimeStruct, L"TimeStruct",
                            {{t.uint8, L"hour"}, {t.uint8, L"minute"}, {t.uint8, L"second"}, {t.uint8, L"fraction"}},
                            {offsetof(aafTimeStruct_t, hour), offsetof(aafTimeStruct_t, minute),
                             offsetof(aafTimeStruct_t, second), offsetof(aafTimeStruct_t, fraction)},
                            sizeof(aafTimeStruct_t));
        t.timeStamp = Record(kAAFTypeID_TimeStamp, L"TimeStamp", {{date, L"date"}, {time, L"time"}},
                             {offsetof(aafTimeStamp_t, date), offsetof(aafTimeStamp_t, time)}, sizeof(aafTimeStamp_t));
        auto* releaseType = Type<TypeDefEnumeration>(
            kAAFTypeID_ProductReleaseType, L"ProductReleaseType", int32,
            std::vector<TypeDefEnumeration::Element>{{L"VersionUnknown", kAAFVersionUnknown},
                                                     {L"VersionReleased", kAAFVersionReleased},
                                                     {L"VersionDebug", kAAFVersionDebug},
                                                     {L"VersionPatched", kAAFVersionPatched},
                                                     {L"VersionBeta", kAAFVersionBeta},
                                                     {L"VersionPrivateBuild", kAAFPrivateBuild}});
        t.productVersion = Record(kAAFTypeID_ProductVersion, L"ProductVersion",
                                  {{t.uint16, L"major"},
                                   {t.uint16, L"minor"},
                                   {t.uint16, L"tertiary"},
                                   {t.uint16, L"patchLevel"},
                                   {releaseType, L"type"}},
                                  {offsetof(aafProductVersion_t, major), offsetof(aafProductVersion_t, minor),
                                   offsetof(aafProductVersion_t, tertiary), offsetof(aafProductVersion_t, patchLevel),
                                   offsetof(aafProductVersion_t, type)},
                                  sizeof(aafProductVersion_t));
        t.versionType =
            Record(kAAFTypeID_VersionType, L"VersionType", {{t.int8, L"major"}, {t.int8, L"minor"}},
                   {offsetof(aafVersionType_t, major), offsetof(aafVersionType_t, minor)}, sizeof(aafVersionType_t));
        t.uint8Array = Vector(kAAFTypeID_UInt8Array, L"UInt8Array", t.uint8);
        t.uint32Array = Vector(kAAFTypeID_UInt32Array, L"UInt32Array", t.uint32);
        t.indirect = Type<TypeDefIndirectType>(kAAFTypeID_Indirect, L"Indirect");
        Type<TypeDefEnumeration>(
            kAAFTypeID_ScanningDirectionType, L"ScanningDirectionType", uint8,
            std::vector<TypeDefEnumeration::Element>{{L"ScanningDirection_LeftToRightTopToBottom", 0},
                                                     {L"ScanningDirection_RightToLeftTopToBottom", 1},
                                                     {L"ScanningDirection_LeftToRightBottomToTop", 2},
                                                     {L"ScanningDirection_RightToLeftBottomToTop", 3},
                                                     {L"ScanningDirection_TopToBottomLeftToRight", 4},
                                                     {L"ScanningDirection_TopToBottomRightToLeft", 5},
                                                     {L"ScanningDirection_BottomToTopLeftToRight", 6},
                                                     {L"ScanningDirection_BottomToTopRightToLeft", 7}});
        m_electroSpatial = Type<TypeDefEnumeration>(
            kAAFTypeID_ElectroSpatialFormulation, L"ElectroSpatialFormulation", int32,
            std::vector<TypeDefEnumeration::Element>{
                {L"ElectroSpatialFormulation_Default", kAAFEssDefault},
                {L"ElectroSpatialFormulation_TwoChannelMode", kAAFEssTwoChannelMode},
                {L"ElectroSpatialFormulation_SingleChannelMode", kAAFEssSingleChannelMode},
                {L"ElectroSpatialFormulation_PrimarySecondaryMode", kAAFEssPrimarySecondaryMode},
                {L"ElectroSpatialFormulation_StereophonicMode", kAAFEssStereophonicMode},
                {L"ElectroSpatialFormulation_SingleChannelDoubleSamplingFrequencyMode",
                 kAAFEssSingleChannelDoubleSamplingFrequencyMode},
                {L"ElectroSpatialFormulation_StereoLeftChannelDoubleSamplingFrequencyMode",
                 kAAFEssStereoLeftChannelDoubleSamplingFrequencyMode},
                {L"ElectroSpatialFormulation_StereoRightChannelDoubleSamplingFrequencyMode",
                 kAAFEssStereoRightChannelDoubleSamplingFrequencyMode},
                {L"ElectroSpatialFormulation_MultiChannelMode", kAAFEssMultiChannelMode}});
    }

    void Classes() {
        auto& c = m_b.c;
        c.interchangeObject = Class(kAAFClassID_InterchangeObject, L"InterchangeObject", nullptr, false);
        c.header = Class(kAAFClassID_Header, L"Header", c.interchangeObject, true);
        c.dictionary = Class(kAAFClassID_Dictionary, L"Dictionary", c.interchangeObject, true);
        c.identification = Class(kAAFClassID_Identification, L"Identification", c.interchangeObject, true);
        c.contentStorage = Class(kAAFClassID_ContentStorage, L"ContentStorage", c.interchangeObject, true);
        c.mob = Class(kAAFClassID_Mob, L"Mob", c.interchangeObject, false);
        c.masterMob = Class(kAAFClassID_MasterMob, L"MasterMob", c.mob, true);
        c.sourceMob = Class(kAAFClassID_SourceMob, L"SourceMob", c.mob, true);
        c.mobSlot = Class(kAAFClassID_MobSlot, L"MobSlot", c.interchangeObject, false);
        c.timelineMobSlot = Class(kAAFClassID_TimelineMobSlot, L"TimelineMobSlot", c.mobSlot, true);
        c.eventMobSlot = Class(kAAFClassID_EventMobSlot, L"EventMobSlot", c.mobSlot, true);
        c.component = Class(kAAFClassID_Component, L"Component", c.interchangeObject, false);
        c.segment = Class(kAAFClassID_Segment, L"Segment", c.component, false);
        c.sequence = Class(kAAFClassID_Sequence, L"Sequence", c.segment, true);
        c.filler = Class(kAAFClassID_Filler, L"Filler", c.segment, true);
        c.timecode = Class(kAAFClassID_Timecode, L"Timecode", c.segment, true);
        c.sourceReference = Class(kAAFClassID_SourceReference, L"SourceReference", c.segment, false);
        c.sourceClip = Class(kAAFClassID_SourceClip, L"SourceClip", c.sourceReference, true);
        c.event = Class(kAAFClassID_Event, L"Event", c.segment, false);
        c.commentMarker = Class(kAAFClassID_CommentMarker, L"CommentMarker", c.event, true);
        c.descriptiveMarker = Class(kAAFClassID_DescriptiveMarker, L"DescriptiveMarker", c.commentMarker, true);
        c.taggedValue = Class(kAAFClassID_TaggedValue, L"TaggedValue", c.interchangeObject, true);
        c.essenceDescriptor = Class(kAAFClassID_EssenceDescriptor, L"EssenceDescriptor", c.interchangeObject, false);
        c.fileDescriptor = Class(kAAFClassID_FileDescriptor, L"FileDescriptor", c.essenceDescriptor, false);
        c.soundDescriptor = Class(kAAFClassID_SoundDescriptor, L"SoundDescriptor", c.fileDescriptor, true);
        c.pcmDescriptor = Class(kAAFClassID_PCMDescriptor, L"PCMDescriptor", c.soundDescriptor, true);
        c.digitalImageDescriptor =
            Class(kAAFClassID_DigitalImageDescriptor, L"DigitalImageDescriptor", c.fileDescriptor, false);
        c.multipleDescriptor = Class(kAAFClassID_MultipleDescriptor, L"MultipleDescriptor", c.fileDescriptor, true);
        c.waveDescriptor = Class(kAAFClassID_WAVEDescriptor, L"WAVEDescriptor", c.fileDescriptor, true);
        c.aifcDescriptor = Class(kAAFClassID_AIFCDescriptor, L"AIFCDescriptor", c.fileDescriptor, true);
        c.tapeDescriptor = Class(kAAFClassID_TapeDescriptor, L"TapeDescriptor", c.essenceDescriptor, true);
        c.physicalDescriptor = Class(kAAFClassID_PhysicalDescriptor, L"PhysicalDescriptor", c.essenceDescriptor, false);
        c.importDescriptor = Class(kAAFClassID_ImportDescriptor, L"ImportDescriptor", c.physicalDescriptor, true);
        c.locator = Class(kAAFClassID_Locator, L"Locator", c.interchangeObject, false);
        c.networkLocator = Class(kAAFClassID_NetworkLocator, L"NetworkLocator", c.locator, true);
        // Definitions are kept by the dictionary, not made as objects.
        c.definitionObject = Class(kAAFClassID_DefinitionObject, L"DefinitionObject", c.interchangeObject, false);
        c.dataDefinition = Class(kAAFClassID_DataDefinition, L"DataDefinition", c.definitionObject, false);

        c.interchangeObject->AddView(MakerOf<ObjectView>());
        c.header->AddView(MakerOf<HeaderView>());
        c.dictionary->AddView(MakerOf<DictionaryView>());
        c.identification->AddView(MakerOf<IdentificationView>());
        c.contentStorage->AddView(MakerOf<ContentStorageView>());
        c.mob->AddView(MakerOf<MobView>());
        c.masterMob->AddView(MakerOf<MasterMobView>());
        c.sourceMob->AddView(MakerOf<SourceMobView>());
        c.mobSlot->AddView(MakerOf<MobSlotView>());
        c.timelineMobSlot->AddView(MakerOf<TimelineMobSlotView>());
        c.eventMobSlot->AddView(MakerOf<EventMobSlotView>());
        c.component->AddView(MakerOf<ComponentView>());
        c.segment->AddView(MakerOf<SegmentView>());
        c.sequence->AddView(MakerOf<SequenceView>());
        c.filler->AddView(MakerOf<FillerView>());
        c.timecode->AddView(MakerOf<TimecodeView>());
        c.sourceReference->AddView(MakerOf<SourceReferenceView>());
        c.sourceClip->AddView(MakerOf<SourceClipView>());
        c.event->AddView(MakerOf<EventView>());
        c.commentMarker->AddView(MakerOf<CommentMarkerView>());
        c.descriptiveMarker->AddView(MakerOf<DescriptiveMarkerView>());
        c.taggedValue->AddView(MakerOf<TaggedValueView>());
        c.essenceDescriptor->AddView(MakerOf<EssenceDescriptorView>());
        c.fileDescriptor->AddView(MakerOf<FileDescriptorView>());
        c.soundDescriptor->AddView(MakerOf<SoundDescriptorView>());
        c.digitalImageDescriptor->AddView(MakerOf<DigitalImageDescriptorView>());
        c.pcmDescriptor->AddView(MakerOf<PCMDescriptorView>());
        c.multipleDescriptor->AddView(MakerOf<MultipleDescriptorView>());
        c.tapeDescriptor->AddView(MakerOf<TapeDescriptorView>());
        c.importDescriptor->AddView(MakerOf<ImportDescriptorView>());
        c.locator->AddView(MakerOf<LocatorView>());
        c.networkLocator->AddView(MakerOf<NetworkLocatorView>());
    }

    void References() {
        auto& c = m_b.c;
        auto& p = m_b.p;
        auto& t = m_b.t;
        auto* taggedRef = Strong(kAAFTypeID_TaggedValueStrongReference, L"TaggedValueStrongReference", c.taggedValue);
        auto* tagged =
            Vector(kAAFTypeID_TaggedValueStrongReferenceVector, L"TaggedValueStrongReferenceVector", taggedRef);
        auto* slotRef = Strong(kAAFTypeID_MobSlotStrongReference, L"MobSlotStrongReference", c.mobSlot);
        auto* mobRef = Strong(kAAFTypeID_MobStrongReference, L"MobStrongReference", c.mob);
        auto* componentRef = Strong(kAAFTypeID_ComponentStrongReference, L"ComponentStrongReference", c.component);
        auto* locatorRef = Strong(kAAFTypeID_LocatorStrongReference, L"LocatorStrongReference", c.locator);
        auto* fileDescRef =
            Strong(kAAFTypeID_FileDescriptorStrongReference, L"FileDescriptorStrongReference", c.fileDescriptor);
        auto* identRef =
            Strong(kAAFTypeID_IdentificationStrongReference, L"IdentificationStrongReference", c.identification);

        p.headerContent =
            Prop(c.header, kAAFPropID_Header_Content, L"Content",
                 Strong(kAAFTypeID_ContentStorageStrongReference, L"ContentStorageStrongReference", c.contentStorage),
                 false);
        p.headerDictionary =
            Prop(c.header, kAAFPropID_Header_Dictionary, L"Dictionary",
                 Strong(kAAFTypeID_DictionaryStrongReference, L"DictionaryStrongReference", c.dictionary), false);
        p.headerIdentificationList = Prop(
            c.header, kAAFPropID_Header_IdentificationList, L"IdentificationList",
            Vector(kAAFTypeID_IdentificationStrongReferenceVector, L"IdentificationStrongReferenceVector", identRef),
            false);
        p.contentMobs = Prop(c.contentStorage, kAAFPropID_ContentStorage_Mobs, L"Mobs",
                             Vector(kAAFTypeID_MobStrongReferenceVector, L"MobStrongReferenceVector", mobRef), false);
        p.mobSlots =
            Prop(c.mob, kAAFPropID_Mob_Slots, L"Slots",
                 Vector(kAAFTypeID_MobSlotStrongReferenceVector, L"MobSlotStrongReferenceVector", slotRef), false);
        p.mobUserComments = Prop(c.mob, kAAFPropID_Mob_UserComments, L"UserComments", tagged, true);
        p.mobAttributes = Prop(c.mob, kAAFPropID_Mob_Attributes, L"Attributes", tagged, true);
        p.sourceMobEssenceDescription =
            Prop(c.sourceMob, kAAFPropID_SourceMob_EssenceDescription, L"EssenceDescription",
                 Strong(kAAFTypeID_EssenceDescriptorStrongReference, L"EssenceDescriptorStrongReference",
                        c.essenceDescriptor),
                 false);
        p.slotSegment = Prop(c.mobSlot, kAAFPropID_MobSlot_Segment, L"Segment",
                             Strong(kAAFTypeID_SegmentStrongReference, L"SegmentStrongReference", c.segment), false);
        p.componentDataDefinition = Prop(c.component, kAAFPropID_Component_DataDefinition, L"DataDefinition",
                                         Type<TypeDefWeakReference>(kAAFTypeID_DataDefinitionWeakReference,
                                                                    L"DataDefinitionWeakReference", c.dataDefinition),
                                         false);
        p.componentUserComments = Prop(c.component, kAAFPropID_Component_UserComments, L"UserComments", tagged, true);
        p.componentAttributes = Prop(c.component, kAAFPropID_Component_Attributes, L"Attributes", tagged, true);
        p.sequenceComponents = Prop(
            c.sequence, kAAFPropID_Sequence_Components, L"Components",
            Vector(kAAFTypeID_ComponentStrongReferenceVector, L"ComponentStrongReferenceVector", componentRef), false);
        p.essenceLocator =
            Prop(c.essenceDescriptor, kAAFPropID_EssenceDescriptor_Locator, L"Locator",
                 Vector(kAAFTypeID_LocatorStrongReferenceVector, L"LocatorStrongReferenceVector", locatorRef), true);
        p.multipleFileDescriptors = Prop(
            c.multipleDescriptor, kAAFPropID_MultipleDescriptor_FileDescriptors, L"FileDescriptors",
            Vector(kAAFTypeID_FileDescriptorStrongReferenceVector, L"FileDescriptorStrongReferenceVector", fileDescRef),
            false);
        p.taggedValueValue = Prop(c.taggedValue, kAAFPropID_TaggedValue_Value, L"Value", t.indirect, false);
    }

    // Plain-data properties, in the published order of each class.
    void Properties() {
        auto& c = m_b.c;
        auto& p = m_b.p;
        auto& t = m_b.t;
        p.headerLastModified = Prop(c.header, kAAFPropID_Header_LastModified, L"LastModified", t.timeStamp, false);
        p.headerVersion = Prop(c.header, kAAFPropID_Header_Version, L"Version", t.versionType, false);
        p.identCompanyName =
            Prop(c.identification, kAAFPropID_Identification_CompanyName, L"CompanyName", t.string, false);
        p.identProductName =
            Prop(c.identification, kAAFPropID_Identification_ProductName, L"ProductName", t.string, false);
        p.identProductVersion =
            Prop(c.identification, kAAFPropID_Identification_ProductVersion, L"ProductVersion", t.productVersion, true);
        p.identProductVersionString = Prop(c.identification, kAAFPropID_Identification_ProductVersionString,
                                           L"ProductVersionString", t.string, false);
        p.identProductID = Prop(c.identification, kAAFPropID_Identification_ProductID, L"ProductID", t.auid, false);
        p.identDate = Prop(c.identification, kAAFPropID_Identification_Date, L"Date", t.timeStamp, false);
        p.identToolkitVersion =
            Prop(c.identification, kAAFPropID_Identification_ToolkitVersion, L"ToolkitVersion", t.productVersion, true);
        p.identPlatform = Prop(c.identification, kAAFPropID_Identification_Platform, L"Platform", t.string, true);
        p.identGenerationAUID =
            Prop(c.identification, kAAFPropID_Identification_GenerationAUID, L"GenerationAUID", t.auid, false);
        p.mobMobID = Prop(c.mob, kAAFPropID_Mob_MobID, L"MobID", t.mobID, false);
        p.mobName = Prop(c.mob, kAAFPropID_Mob_Name, L"Name", t.string, true);
        p.mobLastModified = Prop(c.mob, kAAFPropID_Mob_LastModified, L"LastModified", t.timeStamp, false);
        p.mobCreationTime = Prop(c.mob, kAAFPropID_Mob_CreationTime, L"CreationTime", t.timeStamp, false);
        p.mobUsageCode = Prop(c.mob, kAAFPropID_Mob_UsageCode, L"UsageCode", t.auid, true);
        p.slotSlotID = Prop(c.mobSlot, kAAFPropID_MobSlot_SlotID, L"SlotID", t.uint32, false);
        p.slotSlotName = Prop(c.mobSlot, kAAFPropID_MobSlot_SlotName, L"SlotName", t.string, true);
        p.slotPhysicalTrackNumber =
            Prop(c.mobSlot, kAAFPropID_MobSlot_PhysicalTrackNumber, L"PhysicalTrackNumber", t.uint32, true);
        p.timelineEditRate =
            Prop(c.timelineMobSlot, kAAFPropID_TimelineMobSlot_EditRate, L"EditRate", t.rational, false);
        p.timelineOrigin = Prop(c.timelineMobSlot, kAAFPropID_TimelineMobSlot_Origin, L"Origin", t.position, false);
        p.eventSlotEditRate = Prop(c.eventMobSlot, kAAFPropID_EventMobSlot_EditRate, L"EditRate", t.rational, false);
        p.componentLength = Prop(c.component, kAAFPropID_Component_Length, L"Length", t.length, true);
        p.timecodeStart = Prop(c.timecode, kAAFPropID_Timecode_Start, L"Start", t.position, false);
        p.timecodeFPS = Prop(c.timecode, kAAFPropID_Timecode_FPS, L"FPS", t.uint16, false);
        p.timecodeDrop = Prop(c.timecode, kAAFPropID_Timecode_Drop, L"Drop", t.boolean, false);
        p.sourceRefSourceID = Prop(c.sourceReference, kAAFPropID_SourceReference_SourceID, L"SourceID", t.mobID, true);
        p.sourceRefSourceMobSlotID =
            Prop(c.sourceReference, kAAFPropID_SourceReference_SourceMobSlotID, L"SourceMobSlotID", t.uint32, false);
        p.sourceRefChannelIDs =
            Prop(c.sourceReference, kAAFPropID_SourceReference_ChannelIDs, L"ChannelIDs", t.uint32Array, true);
        p.sourceRefMonoSourceSlotIDs = Prop(c.sourceReference, kAAFPropID_SourceReference_MonoSourceSlotIDs,
                                            L"MonoSourceSlotIDs", t.uint32Array, true);
        p.sourceClipStartTime = Prop(c.sourceClip, kAAFPropID_SourceClip_StartTime, L"StartTime", t.position, true);
        p.eventPosition = Prop(c.event, kAAFPropID_Event_Position, L"Position", t.position, false);
        p.eventComment = Prop(c.event, kAAFPropID_Event_Comment, L"Comment", t.string, true);
        p.taggedValueName = Prop(c.taggedValue, kAAFPropID_TaggedValue_Name, L"Name", t.string, false);
        p.fileSampleRate =
            Prop(c.fileDescriptor, kAAFPropID_FileDescriptor_SampleRate, L"SampleRate", t.rational, true);
        p.fileLength = Prop(c.fileDescriptor, kAAFPropID_FileDescriptor_Length, L"Length", t.length, true);
        p.soundAudioSamplingRate = Prop(c.soundDescriptor, kAAFPropID_SoundDescriptor_AudioSamplingRate,
                                        L"AudioSamplingRate", t.rational, false);
        p.soundLocked = Prop(c.soundDescriptor, kAAFPropID_SoundDescriptor_Locked, L"Locked", t.boolean, true);
        p.soundElectroSpatial = Prop(c.soundDescriptor, kAAFPropID_SoundDescriptor_ElectroSpatial, L"ElectroSpatial",
                                     m_electroSpatial, true);
        p.soundChannels = Prop(c.soundDescriptor, kAAFPropID_SoundDescriptor_Channels, L"Channels", t.uint32, false);
        p.soundQuantizationBits =
            Prop(c.soundDescriptor, kAAFPropID_SoundDescriptor_QuantizationBits, L"QuantizationBits", t.uint32, false);
        p.soundCompression =
            Prop(c.soundDescriptor, kAAFPropID_SoundDescriptor_Compression, L"Compression", t.auid, true);
        p.imageCompression =
            Prop(c.digitalImageDescriptor, kAAFPropID_DigitalImageDescriptor_Compression, L"Compression", t.auid, true);
        p.imageStoredHeight = Prop(c.digitalImageDescriptor, kAAFPropID_DigitalImageDescriptor_StoredHeight,
                                   L"StoredHeight", t.uint32, false);
        p.imageStoredWidth = Prop(c.digitalImageDescriptor, kAAFPropID_DigitalImageDescriptor_StoredWidth,
                                  L"StoredWidth", t.uint32, false);
        p.imageAspectRatio = Prop(c.digitalImageDescriptor, kAAFPropID_DigitalImageDescriptor_ImageAspectRatio,
                                  L"ImageAspectRatio", t.rational, false);
        p.imageGamma = Prop(c.digitalImageDescriptor, kAAFPropID_DigitalImageDescriptor_Gamma, L"Gamma", t.auid, true);
        p.imageAlignmentFactor = Prop(c.digitalImageDescriptor, kAAFPropID_DigitalImageDescriptor_ImageAlignmentFactor,
                                      L"ImageAlignmentFactor", t.uint32, true);
        p.pcmBlockAlign = Prop(c.pcmDescriptor, kAAFPropID_PCMDescriptor_BlockAlign, L"BlockAlign", t.uint16, false);
        p.pcmAverageBPS = Prop(c.pcmDescriptor, kAAFPropID_PCMDescriptor_AverageBPS, L"AverageBPS", t.uint32, false);
        p.waveSummary = Prop(c.waveDescriptor, kAAFPropID_WAVEDescriptor_Summary, L"Summary", t.uint8Array, false);
        p.aifcSummary = Prop(c.aifcDescriptor, kAAFPropID_AIFCDescriptor_Summary, L"Summary", t.uint8Array, false);
        p.tapeManufacturerID =
            Prop(c.tapeDescriptor, kAAFPropID_TapeDescriptor_ManufacturerID, L"ManufacturerID", t.string, true);
        p.tapeModel = Prop(c.tapeDescriptor, kAAFPropID_TapeDescriptor_Model, L"Model", t.string, true);
        p.tapeLength = Prop(c.tapeDescriptor, kAAFPropID_TapeDescriptor_TapeLength, L"TapeLength", t.uint32, true);
        p.networkURLString = Prop(c.networkLocator, kAAFPropID_NetworkLocator_URLString, L"URLString", t.string, false);
    }

    void DataDefinitions() {
        const std::pair<const aafUID_t*, const wchar_t*> defs[] = {
            {&kAAFDataDef_Picture, L"Picture"},
            {&kAAFDataDef_Sound, L"Sound"},
            {&kAAFDataDef_Timecode, L"Timecode"},
            {&kAAFDataDef_DescriptiveMetadata, L"DescriptiveMetadata"},
            {&kAAFDataDef_LegacySound, L"LegacySound"},
            {&kAAFDataDef_LegacyTimecode, L"LegacyTimecode"},
            {&kAAFDataDef_LegacyPicture, L"LegacyPicture"},
        };
        for (const auto& d : defs) m_s.Register(*m_s.Own(std::make_unique<DataDefinition>(m_s, *d.first, d.second)));
    }

    Schema& m_s;
    BuiltinDefinitions& m_b;
    TypeDefinition* m_electroSpatial = nullptr;
};

}  // namespace

void BuildBuiltinSchema(Schema& schema) { Builder(schema).Run(); }

}  // namespace aafmodel
