#pragma once
/// Direct pointers to the built-in definitions of a schema, so that the
/// views reach the properties they work on without a look-up by id.
namespace aafmodel {

class ClassDefinition;
class PropertyDefinition;
class TypeDefinition;

struct BuiltinDefinitions {
    struct Classes {
        ClassDefinition *interchangeObject, *header, *dictionary, *identification, *contentStorage;
        ClassDefinition *mob, *masterMob, *sourceMob;
        ClassDefinition *mobSlot, *timelineMobSlot, *eventMobSlot;
        ClassDefinition *component, *segment, *sequence, *filler, *timecode, *sourceReference, *sourceClip;
        ClassDefinition *event, *commentMarker, *descriptiveMarker, *taggedValue;
        ClassDefinition *essenceDescriptor, *fileDescriptor, *soundDescriptor, *pcmDescriptor;
        ClassDefinition *digitalImageDescriptor, *multipleDescriptor, *waveDescriptor, *aifcDescriptor;
        ClassDefinition *tapeDescriptor, *physicalDescriptor, *importDescriptor, *locator, *networkLocator;
        ClassDefinition *definitionObject, *dataDefinition;
    } c{};
    struct Types {
        TypeDefinition *uint8, *uint16, *uint32, *uint64, *int8, *int16, *int32, *int64, *position, *length;
        TypeDefinition *boolean, *character, *string, *auid, *mobID, *rational, *timeStamp;
        TypeDefinition *productVersion, *versionType, *uint8Array, *uint32Array, *indirect;
    } t{};
    struct Properties {
        PropertyDefinition *headerLastModified, *headerContent, *headerDictionary, *headerVersion,
            *headerIdentificationList;
        PropertyDefinition *identCompanyName, *identProductName, *identProductVersion, *identProductVersionString,
            *identProductID, *identDate, *identToolkitVersion, *identPlatform, *identGenerationAUID;
        PropertyDefinition *contentMobs;
        PropertyDefinition *mobMobID, *mobName, *mobSlots, *mobLastModified, *mobCreationTime, *mobUserComments,
            *mobAttributes, *mobUsageCode;
        PropertyDefinition *sourceMobEssenceDescription;
        PropertyDefinition *slotSlotID, *slotSlotName, *slotSegment, *slotPhysicalTrackNumber;
        PropertyDefinition *timelineEditRate, *timelineOrigin, *eventSlotEditRate;
        PropertyDefinition *componentDataDefinition, *componentLength, *componentUserComments, *componentAttributes;
        PropertyDefinition *sequenceComponents, *timecodeStart, *timecodeFPS, *timecodeDrop;
        PropertyDefinition *sourceRefSourceID, *sourceRefSourceMobSlotID, *sourceRefChannelIDs,
            *sourceRefMonoSourceSlotIDs, *sourceClipStartTime;
        PropertyDefinition *eventPosition, *eventComment, *taggedValueName, *taggedValueValue;
        PropertyDefinition *essenceLocator, *fileSampleRate, *fileLength;
        PropertyDefinition *soundAudioSamplingRate, *soundLocked, *soundElectroSpatial, *soundChannels,
            *soundQuantizationBits, *soundCompression, *pcmBlockAlign, *pcmAverageBPS;
        PropertyDefinition *imageCompression, *imageStoredHeight, *imageStoredWidth, *imageAspectRatio, *imageGamma,
            *imageAlignmentFactor;
        PropertyDefinition *multipleFileDescriptors, *waveSummary, *aifcSummary;
        PropertyDefinition *tapeManufacturerID, *tapeModel, *tapeLength, *networkURLString;
    } p{};
};

}  // namespace aafmodel
