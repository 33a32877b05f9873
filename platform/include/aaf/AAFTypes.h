#pragma once
/// The records and scalar types of the AAF object model, as the plug-in and
/// the library pass them across the interface.
#include <cstdint>
#include <cstring>

typedef int32_t AAFRESULT;
typedef int8_t aafInt8;
typedef int16_t aafInt16;
typedef int32_t aafInt32;
typedef int64_t aafInt64;
typedef uint8_t aafUInt8;
typedef uint16_t aafUInt16;
typedef uint32_t aafUInt32;
typedef uint64_t aafUInt64;
typedef aafInt32 aafBoolean_t;
typedef aafBoolean_t aafBool;
inline constexpr aafBool kAAFFalse = 0;
inline constexpr aafBool kAAFTrue = 1;

/// Characters are the platform's wide characters (32 bits here).
typedef wchar_t aafCharacter;
typedef aafCharacter* aafString_t;
typedef const aafCharacter* aafCharacter_constptr;
typedef aafUInt8* aafMemPtr_t;
typedef aafUInt8* aafDataBuffer_t;
typedef const aafUInt8* aafMemConstPtr_t;

typedef aafInt64 aafPosition_t;
typedef aafInt64 aafLength_t;
typedef aafInt64 aafFrameOffset_t;
typedef aafInt64 aafFrameLength_t;
typedef aafUInt32 aafSlotID_t;
typedef aafUInt32 aafNumSlots_t;
typedef aafInt32 aafDropType_t;
typedef aafInt32 aafFileRev_t;
typedef aafUInt32 aafFileAccess_t;
typedef aafInt32 aafFileExistence_t;

struct _aafUID_t {
    aafUInt32 Data1;
    aafUInt16 Data2;
    aafUInt16 Data3;
    aafUInt8 Data4[8];
};
typedef _aafUID_t aafUID_t;
typedef const aafUID_t& aafUID_constref;
typedef const aafUID_t* aafUID_constptr;
typedef const aafUID_t& REFIID;
typedef aafUID_t IID;
typedef aafUID_t aafClassID_t;

inline bool operator==(const aafUID_t& a, const aafUID_t& b) { return std::memcmp(&a, &b, sizeof a) == 0; }
inline bool operator!=(const aafUID_t& a, const aafUID_t& b) { return !(a == b); }

/// The 32-byte Mob identifier: a SMPTE UMID label, length and instance
/// number, then the material number.
struct _aafMobID_t {
    aafUInt8 SMPTELabel[12];
    aafUInt8 length;
    aafUInt8 instanceHigh;
    aafUInt8 instanceMid;
    aafUInt8 instanceLow;
    aafUID_t material;
};
typedef _aafMobID_t aafMobID_t;
typedef const aafMobID_t& aafMobID_constref;

inline bool operator==(const aafMobID_t& a, const aafMobID_t& b) { return std::memcmp(&a, &b, sizeof a) == 0; }
inline bool operator!=(const aafMobID_t& a, const aafMobID_t& b) { return !(a == b); }

struct _aafRational_t {
    aafInt32 numerator;
    aafInt32 denominator;
};
typedef _aafRational_t aafRational_t;
typedef const aafRational_t& aafRational_constref;

struct _aafDateStruct_t {
    aafInt16 year;
    aafUInt8 month;
    aafUInt8 day;
};
typedef _aafDateStruct_t aafDateStruct_t;

/// `fraction` counts hundredths of a second.
struct _aafTimeStruct_t {
    aafUInt8 hour;
    aafUInt8 minute;
    aafUInt8 second;
    aafUInt8 fraction;
};
typedef _aafTimeStruct_t aafTimeStruct_t;

struct _aafTimeStamp_t {
    aafDateStruct_t date;
    aafTimeStruct_t time;
};
typedef _aafTimeStamp_t aafTimeStamp_t;
typedef const aafTimeStamp_t& aafTimeStamp_constref;

struct _aafTimecode_t {
    aafFrameOffset_t startFrame;
    aafDropType_t drop;
    aafUInt16 fps;
};
typedef _aafTimecode_t aafTimecode_t;

struct _aafSourceRef_t {
    aafMobID_t sourceID;
    aafSlotID_t sourceSlotID;
    aafPosition_t startTime;
};
typedef _aafSourceRef_t aafSourceRef_t;

enum _aafProductReleaseType_e : aafInt32 {
    kAAFVersionUnknown = 0,
    kAAFVersionReleased = 1,
    kAAFVersionDebug = 2,
    kAAFVersionPatched = 3,
    kAAFVersionBeta = 4,
    kAAFPrivateBuild = 5
};
typedef _aafProductReleaseType_e aafProductReleaseType_t;

struct _aafProductVersion_t {
    aafUInt16 major;
    aafUInt16 minor;
    aafUInt16 tertiary;
    aafUInt16 patchLevel;
    aafProductReleaseType_t type;
};
typedef _aafProductVersion_t aafProductVersion_t;
typedef const aafProductVersion_t& aafProductVersion_constref;

struct _aafProductIdentification_t {
    aafCharacter* companyName;
    aafCharacter* productName;
    aafCharacter* productVersionString;
    aafUID_t productID;
    aafCharacter* platform;
    aafProductVersion_t* productVersion;
};
typedef _aafProductIdentification_t aafProductIdentification_t;

struct _aafVersionType_t {
    aafInt8 major;
    aafInt8 minor;
};
typedef _aafVersionType_t aafVersionType_t;

enum _aafMobKind_e : aafInt32 {
    kAAFCompMob = 0,
    kAAFMasterMob = 1,
    kAAFFileMob = 2,
    kAAFTapeMob = 3,
    kAAFFilmMob = 4,
    kAAFPrimaryMob = 5,
    kAAFAllMob = 6,
    kAAFPhysicalMob = 7
};
typedef _aafMobKind_e aafMobKind_t;

enum _aafSearchTag_e : aafInt32 {
    kAAFNoSearch = 0,
    kAAFByMobID = 1,
    kAAFByMobKind = 2,
    kAAFByName = 3,
    kAAFByClass = 4,
    kAAFByDataDef = 5,
    kAAFByMediaCrit = 6,
    kAAFByUsageCode = 7,
    kAAFByMasterMobUsageCode = 8,
    kAAFBySlotUsageCode = 9,
    kAAFByCompositionMobUsageCode = 10
};
typedef _aafSearchTag_e aafSearchTag_t;

struct _aafSearchCrit_t {
    aafSearchTag_t searchTag;
    union {
        aafMobID_t mobID;
        aafMobKind_t mobKind;
        aafString_t name;
        aafClassID_t objClass;
        aafUID_t datadef;
        aafUID_t usageCode;
    } tags;
};
typedef _aafSearchCrit_t aafSearchCrit_t;

enum _eAAFTypeCategory_e : aafInt32 {
    kAAFTypeCatUnknown = 0,
    kAAFTypeCatInt = 1,
    kAAFTypeCatCharacter = 2,
    kAAFTypeCatStrongObjRef = 3,
    kAAFTypeCatWeakObjRef = 4,
    kAAFTypeCatRename = 5,
    kAAFTypeCatEnum = 6,
    kAAFTypeCatFixedArray = 7,
    kAAFTypeCatVariableArray = 8,
    kAAFTypeCatSet = 9,
    kAAFTypeCatRecord = 10,
    kAAFTypeCatStream = 11,
    kAAFTypeCatString = 12,
    kAAFTypeCatExtEnum = 13,
    kAAFTypeCatIndirect = 14,
    kAAFTypeCatOpaque = 15,
    kAAFTypeCatEncrypted = 16
};
typedef _eAAFTypeCategory_e eAAFTypeCategory_t;

enum _aafFadeType_e : aafInt32 { kAAFFadeNone = 0, kAAFFadeLinearAmp = 1, kAAFFadeLinearPower = 2 };
typedef _aafFadeType_e aafFadeType_t;

enum _aafElectroSpatialFormulation_e : aafInt32 {
    kAAFEssDefault = 0,
    kAAFEssTwoChannelMode = 1,
    kAAFEssSingleChannelMode = 2,
    kAAFEssPrimarySecondaryMode = 3,
    kAAFEssStereophonicMode = 4,
    kAAFEssSingleChannelDoubleSamplingFrequencyMode = 7,
    kAAFEssStereoLeftChannelDoubleSamplingFrequencyMode = 8,
    kAAFEssStereoRightChannelDoubleSamplingFrequencyMode = 9,
    kAAFEssMultiChannelMode = 15
};
typedef _aafElectroSpatialFormulation_e aafElectroSpatialFormulation_t;

/// Tape form factors are not written by this system; the other published
/// values (1 to 7) pass through as numbers.
enum _aafTapeCaseType_e : aafInt32 { kAAFTapeCaseNull = 0 };
typedef _aafTapeCaseType_e aafTapeCaseType_t;

enum _aafVideoSignalType_e : aafInt32 {
    kAAFVideoSignalNull = 0,
    kAAFNTSCSignal = 1,
    kAAFPALSignal = 2,
    kAAFSECAMSignal = 3
};
typedef _aafVideoSignalType_e aafVideoSignalType_t;

enum _aafTapeFormatType_e : aafInt32 {
    kAAFTapeFormatNull = 0,
    kAAFBetacamFormat = 1,
    kAAFBetacamSPFormat = 2,
    kAAFVHSFormat = 3,
    kAAFSVHSFormat = 4,
    kAAF8mmFormat = 5,
    kAAFHi8Format = 6
};
typedef _aafTapeFormatType_e aafTapeFormatType_t;

typedef aafInt32 aafCompressEnable_t;
typedef aafInt32 aafMediaOpenMode_t;
typedef aafInt32 aafDepend_t;
typedef aafInt32 aafIncMedia_t;
typedef aafInt32 aafCriteriaType_t;
typedef aafUInt32 aafMediaCriteria_t;
typedef aafInt32 aafEdgeType_t;
typedef aafInt32 aafFilmType_t;
typedef aafInt32 aafPulldownKind_t;
typedef aafInt32 aafPhaseFrame_t;
typedef aafInt32 aafPulldownDir_t;
typedef aafUID_t aafFileFormat_t;
typedef const aafLength_t& aafLength_constref;
typedef aafInt32 aafAppendOption_t;
typedef aafInt32 aafFrameLayout_t;
typedef aafInt32 aafAlphaTransparency_t;

/// A multi-channel essence request; kept for the published signatures.
struct _aafmMultiCreate_t;
typedef _aafmMultiCreate_t aafmMultiCreate_t;
struct _aafEdgecode_t {
    aafFrameOffset_t startFrame;
    aafFilmType_t filmKind;
    aafEdgeType_t codeFormat;
    aafUInt8 header[8];
};
typedef _aafEdgecode_t aafEdgecode_t;
