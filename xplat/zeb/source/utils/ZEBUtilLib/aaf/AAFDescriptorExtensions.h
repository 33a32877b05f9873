#pragma once
/// What the host wants to know of a clip beyond the published class model:
/// dynamic optional properties of the descriptor classes, registered on the
/// class definition at first use and set through the generic property
/// interface; the image boxes as a record type of four rationals; and two
/// small object functions.
#include "aaf/AAF.h"
#include "tov/TOVResult.h"
#include "tov/tovUID.h"

namespace ZEB {
namespace AAFUtils {

/// PositionX, PositionY, Width, Height: 32 bytes, members at 0, 8, 16 and 24.
struct aafBoundsBox_t {
    _aafRational_t PositionX;
    _aafRational_t PositionY;
    _aafRational_t Width;
    _aafRational_t Height;
};

inline constexpr aafUID_t kAAFPropID_MediaContainerGUID = {
    0x92790417, 0x0131, 0x4A05, {0x89, 0x8D, 0x16, 0x76, 0x91, 0xE1, 0x1C, 0xA1}};
inline constexpr aafUID_t kAAFPropID_ContainerHandlerGUID = {
    0x0E044501, 0x0101, 0x0101, {0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x03}};
inline constexpr aafUID_t kAAFPropID_MediaAccessKind = {
    0x9CDBF5F3, 0xFA40, 0x40B6, {0x9C, 0xF9, 0xE1, 0x62, 0xAA, 0xF4, 0xDE, 0x80}};
inline constexpr aafUID_t kAAFPropID_DigitalImageDescriptor_BufferFillOrder = {
    0x0E044701, 0x0101, 0x0101, {0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x03}};
inline constexpr aafUID_t kAAFPropID_DigitalImageDescriptor_ImageRotation = {
    0x0E040101, 0x0101, 0x0112, {0x06, 0x0E, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01}};
inline constexpr aafUID_t kAAFTypeID_OrrinBoundsBox = {
    0x0E040301, 0x0200, 0x0000, {0x06, 0x0E, 0x2B, 0x34, 0x01, 0x04, 0x01, 0x01}};
inline constexpr aafUID_t kAAFPropID_EssenceBox = {
    0x0E040101, 0x0101, 0x0107, {0x06, 0x0E, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01}};
inline constexpr aafUID_t kAAFPropID_SourceBox = {
    0x0E040101, 0x0101, 0x0108, {0x06, 0x0E, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01}};
inline constexpr aafUID_t kAAFPropID_ValidBox = {
    0x0E040101, 0x0101, 0x0106, {0x06, 0x0E, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01}};

TOVRESULT SetMediaContainerGUID(IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor, _tovUID id);
TOVRESULT SetContainerHandlerGUID(IAAFDictionary* dictionary, IAAFEssenceDescriptor* descriptor, _tovUID id);
TOVRESULT SetMediaAccessKind(IAAFDictionary* dictionary, IAAFFileDescriptor* descriptor, unsigned int kind);
/// `order` must be a known element of the scanning direction enumeration.
TOVRESULT SetBufferFillOrder(IAAFDictionary* dictionary, IAAFDigitalImageDescriptor* descriptor, int order);
TOVRESULT SetImageRotation(IAAFDictionary* dictionary, IAAFDigitalImageDescriptor* descriptor, _aafRational_t rotation);
/// Makes the slot's segment a sequence (of the former segment) unless it is one.
TOVRESULT InsertSequenceToTimelineMobSlot(IAAFDictionary* dictionary, IAAFMobSlot* slot);
/// The class of `object`; throws 0x8000FFFF as an int when it cannot be told
/// (the dictionary, which has no class definition to ask, among others).
_aafUID_t GetAAFClassID(IAAFObject* object);
TOVRESULT RegisterOrrinBoundsBoxTypeMembers(IAAFTypeDef* typeDef);
TOVRESULT InitializeOrrinBoundsBoxType(IAAFDictionary* dictionary, IAAFTypeDef* typeDef);
/// Sets EssenceBox, SourceBox and ValidBox, registering the record type once per dictionary.
TOVRESULT PutBoxesToAAF(IAAFDictionary* dictionary, IAAFDigitalImageDescriptor* descriptor, aafBoundsBox_t& essenceBox,
                        aafBoundsBox_t& sourceBox, aafBoundsBox_t& validBox);
aafBoundsBox_t ToAAFBox(_aafRational_t positionX, _aafRational_t positionY, _aafRational_t width,
                        _aafRational_t height);

}  // namespace AAFUtils
}  // namespace ZEB
