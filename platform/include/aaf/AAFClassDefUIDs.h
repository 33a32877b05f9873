#pragma once
/// Class identifiers of the AAF object model (AUID_AAF<Class> = kAAFClassID_<Class>).
#include "aaf/AAFTypes.h"

inline constexpr aafUID_t kAAFClassID_InterchangeObject = {
    0x0D010101, 0x0101, 0x0100, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFInterchangeObject = kAAFClassID_InterchangeObject;
inline constexpr aafUID_t kAAFClassID_Object = kAAFClassID_InterchangeObject;
inline constexpr aafUID_t AUID_AAFObject = kAAFClassID_InterchangeObject;
inline constexpr aafUID_t kAAFClassID_Header = {
    0x0D010101, 0x0101, 0x2F00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFHeader = kAAFClassID_Header;
inline constexpr aafUID_t kAAFClassID_Dictionary = {
    0x0D010101, 0x0101, 0x2200, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFDictionary = kAAFClassID_Dictionary;
inline constexpr aafUID_t kAAFClassID_Identification = {
    0x0D010101, 0x0101, 0x3000, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFIdentification = kAAFClassID_Identification;
inline constexpr aafUID_t kAAFClassID_ContentStorage = {
    0x0D010101, 0x0101, 0x1800, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFContentStorage = kAAFClassID_ContentStorage;
inline constexpr aafUID_t kAAFClassID_Mob = {
    0x0D010101, 0x0101, 0x3400, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFMob = kAAFClassID_Mob;
inline constexpr aafUID_t kAAFClassID_MasterMob = {
    0x0D010101, 0x0101, 0x3600, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFMasterMob = kAAFClassID_MasterMob;
inline constexpr aafUID_t kAAFClassID_SourceMob = {
    0x0D010101, 0x0101, 0x3700, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFSourceMob = kAAFClassID_SourceMob;
inline constexpr aafUID_t kAAFClassID_MobSlot = {
    0x0D010101, 0x0101, 0x3800, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFMobSlot = kAAFClassID_MobSlot;
inline constexpr aafUID_t kAAFClassID_TimelineMobSlot = {
    0x0D010101, 0x0101, 0x3B00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFTimelineMobSlot = kAAFClassID_TimelineMobSlot;
inline constexpr aafUID_t kAAFClassID_EventMobSlot = {
    0x0D010101, 0x0101, 0x3900, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFEventMobSlot = kAAFClassID_EventMobSlot;
inline constexpr aafUID_t kAAFClassID_Component = {
    0x0D010101, 0x0101, 0x0200, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFComponent = kAAFClassID_Component;
inline constexpr aafUID_t kAAFClassID_Segment = {
    0x0D010101, 0x0101, 0x0300, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFSegment = kAAFClassID_Segment;
inline constexpr aafUID_t kAAFClassID_Sequence = {
    0x0D010101, 0x0101, 0x0F00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFSequence = kAAFClassID_Sequence;
inline constexpr aafUID_t kAAFClassID_Filler = {
    0x0D010101, 0x0101, 0x0900, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFFiller = kAAFClassID_Filler;
inline constexpr aafUID_t kAAFClassID_Timecode = {
    0x0D010101, 0x0101, 0x1400, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFTimecode = kAAFClassID_Timecode;
inline constexpr aafUID_t kAAFClassID_SourceReference = {
    0x0D010101, 0x0101, 0x1000, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFSourceReference = kAAFClassID_SourceReference;
inline constexpr aafUID_t kAAFClassID_SourceClip = {
    0x0D010101, 0x0101, 0x1100, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFSourceClip = kAAFClassID_SourceClip;
inline constexpr aafUID_t kAAFClassID_Event = {
    0x0D010101, 0x0101, 0x0600, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFEvent = kAAFClassID_Event;
inline constexpr aafUID_t kAAFClassID_CommentMarker = {
    0x0D010101, 0x0101, 0x0800, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFCommentMarker = kAAFClassID_CommentMarker;
inline constexpr aafUID_t kAAFClassID_DescriptiveMarker = {
    0x0D010101, 0x0101, 0x4100, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFDescriptiveMarker = kAAFClassID_DescriptiveMarker;
inline constexpr aafUID_t kAAFClassID_TaggedValue = {
    0x0D010101, 0x0101, 0x3F00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFTaggedValue = kAAFClassID_TaggedValue;
inline constexpr aafUID_t kAAFClassID_EssenceDescriptor = {
    0x0D010101, 0x0101, 0x2400, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFEssenceDescriptor = kAAFClassID_EssenceDescriptor;
inline constexpr aafUID_t kAAFClassID_FileDescriptor = {
    0x0D010101, 0x0101, 0x2500, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFFileDescriptor = kAAFClassID_FileDescriptor;
inline constexpr aafUID_t kAAFClassID_SoundDescriptor = {
    0x0D010101, 0x0101, 0x4200, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFSoundDescriptor = kAAFClassID_SoundDescriptor;
inline constexpr aafUID_t kAAFClassID_PCMDescriptor = {
    0x0D010101, 0x0101, 0x4800, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFPCMDescriptor = kAAFClassID_PCMDescriptor;
inline constexpr aafUID_t kAAFClassID_DigitalImageDescriptor = {
    0x0D010101, 0x0101, 0x2700, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFDigitalImageDescriptor = kAAFClassID_DigitalImageDescriptor;
inline constexpr aafUID_t kAAFClassID_MultipleDescriptor = {
    0x0D010101, 0x0101, 0x4400, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFMultipleDescriptor = kAAFClassID_MultipleDescriptor;
inline constexpr aafUID_t kAAFClassID_WAVEDescriptor = {
    0x0D010101, 0x0101, 0x2C00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFWAVEDescriptor = kAAFClassID_WAVEDescriptor;
inline constexpr aafUID_t kAAFClassID_AIFCDescriptor = {
    0x0D010101, 0x0101, 0x2600, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFAIFCDescriptor = kAAFClassID_AIFCDescriptor;
inline constexpr aafUID_t kAAFClassID_TapeDescriptor = {
    0x0D010101, 0x0101, 0x2E00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFTapeDescriptor = kAAFClassID_TapeDescriptor;
// SKIP PhysicalDescriptor
inline constexpr aafUID_t kAAFClassID_ImportDescriptor = {
    0x0D010101, 0x0101, 0x4A00, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFImportDescriptor = kAAFClassID_ImportDescriptor;
inline constexpr aafUID_t kAAFClassID_Locator = {
    0x0D010101, 0x0101, 0x3100, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFLocator = kAAFClassID_Locator;
inline constexpr aafUID_t kAAFClassID_NetworkLocator = {
    0x0D010101, 0x0101, 0x3200, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFNetworkLocator = kAAFClassID_NetworkLocator;
inline constexpr aafUID_t kAAFClassID_TypeDefinitionRecord = {
    0x0D010101, 0x020D, 0x0000, {0x06, 0x0E, 0x2B, 0x34, 0x02, 0x06, 0x01, 0x01}};
inline constexpr aafUID_t AUID_AAFTypeDefinitionRecord = kAAFClassID_TypeDefinitionRecord;
inline constexpr aafUID_t kAAFClassID_TypeDefRecord = kAAFClassID_TypeDefinitionRecord;
inline constexpr aafUID_t AUID_AAFTypeDefRecord = kAAFClassID_TypeDefinitionRecord;

// The project's own identifiers: the published sheet we work from gives no
// value for these, so they live under our own prefix (Data1 "ORLO").
inline constexpr aafUID_t kAAFClassID_PhysicalDescriptor = {
    0x4F524C4F, 0x0001, 0x0001, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t AUID_AAFPhysicalDescriptor = kAAFClassID_PhysicalDescriptor;
inline constexpr aafUID_t kAAFClassID_DefinitionObject = {
    0x4F524C4F, 0x0001, 0x0002, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t AUID_AAFDefinitionObject = kAAFClassID_DefinitionObject;
inline constexpr aafUID_t kAAFClassID_DataDefinition = {
    0x4F524C4F, 0x0001, 0x0003, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t AUID_AAFDataDefinition = kAAFClassID_DataDefinition;
inline constexpr aafUID_t kAAFClassID_ClassDefinition = {
    0x4F524C4F, 0x0001, 0x0004, {0x8F, 0x1C, 0x5A, 0x3E, 0x4F, 0x52, 0x4C, 0x4F}};
inline constexpr aafUID_t AUID_AAFClassDefinition = kAAFClassID_ClassDefinition;
