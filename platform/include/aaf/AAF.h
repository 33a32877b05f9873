#pragma once
/// Everything of the AAF object model that a caller needs: records, results,
/// identifiers, interfaces, and the library's C entry points. The plug-in
/// reaches these entry points through the loader's forwarders of the same
/// names; the library exports them.
#include "aaf/AAFCOM.h"
#include "aaf/AAFClassDefUIDs.h"
#include "aaf/AAFDataDefs.h"
#include "aaf/AAFForward.h"
#include "aaf/AAFInterfaceIDs.h"
#include "aaf/AAFPropertyDefs.h"
#include "aaf/AAFResult.h"
#include "aaf/AAFTypeDefUIDs.h"
#include "aaf/AAFTypes.h"
#include "aaf/IAAFClassDef.h"
#include "aaf/IAAFCommentMarker.h"
#include "aaf/IAAFComponent.h"
#include "aaf/IAAFComponent2.h"
#include "aaf/IAAFContentStorage.h"
#include "aaf/IAAFDataDef.h"
#include "aaf/IAAFDefObject.h"
#include "aaf/IAAFDescriptiveMarker.h"
#include "aaf/IAAFDictionary.h"
#include "aaf/IAAFDigitalImageDescriptor.h"
#include "aaf/IAAFEssenceDescriptor.h"
#include "aaf/IAAFEvent.h"
#include "aaf/IAAFEventMobSlot.h"
#include "aaf/IAAFFile.h"
#include "aaf/IAAFFileDescriptor.h"
#include "aaf/IAAFFiller.h"
#include "aaf/IAAFHeader.h"
#include "aaf/IAAFIdentification.h"
#include "aaf/IAAFImportDescriptor.h"
#include "aaf/IAAFLocator.h"
#include "aaf/IAAFMasterMob.h"
#include "aaf/IAAFMetaDefinition.h"
#include "aaf/IAAFMob.h"
#include "aaf/IAAFMob2.h"
#include "aaf/IAAFMobSlot.h"
#include "aaf/IAAFMultipleDescriptor.h"
#include "aaf/IAAFNetworkLocator.h"
#include "aaf/IAAFObject.h"
#include "aaf/IAAFPCMDescriptor.h"
#include "aaf/IAAFProperty.h"
#include "aaf/IAAFPropertyDef.h"
#include "aaf/IAAFPropertyValue.h"
#include "aaf/IAAFSegment.h"
#include "aaf/IAAFSequence.h"
#include "aaf/IAAFSoundDescriptor.h"
#include "aaf/IAAFSourceClip.h"
#include "aaf/IAAFSourceMob.h"
#include "aaf/IAAFSourceReference.h"
#include "aaf/IAAFSourceReference2.h"
#include "aaf/IAAFTaggedValue.h"
#include "aaf/IAAFTapeDescriptor.h"
#include "aaf/IAAFTimecode.h"
#include "aaf/IAAFTimelineMobSlot.h"
#include "aaf/IAAFTypeDef.h"
#include "aaf/IAAFTypeDefEnum.h"
#include "aaf/IAAFTypeDefIndirect.h"
#include "aaf/IAAFTypeDefInt.h"
#include "aaf/IAAFTypeDefObjectRef.h"
#include "aaf/IAAFTypeDefRecord.h"
#include "aaf/IAAFTypeDefString.h"
#include "aaf/IAAFTypeDefStrongObjRef.h"
#include "aaf/IAAFTypeDefVariableArray.h"
#include "aaf/IAAFTypeDefWeakObjRef.h"
#include "aaf/IEnumAAFComponents.h"
#include "aaf/IEnumAAFFileDescriptors.h"
#include "aaf/IEnumAAFLocators.h"
#include "aaf/IEnumAAFMobSlots.h"
#include "aaf/IEnumAAFMobs.h"
#include "aaf/IEnumAAFProperties.h"
#include "aaf/IEnumAAFPropertyDefs.h"
#include "aaf/IEnumAAFPropertyValues.h"
#include "aaf/IEnumAAFTaggedValues.h"

extern "C" {
AAFRESULT AAFFileOpenExistingRead(const aafCharacter* pFileName, aafUInt32 modeFlags, IAAFFile** ppFile);
AAFRESULT AAFFileOpenExistingModify(const aafCharacter* pFileName, aafUInt32 modeFlags,
                                    aafProductIdentification_t* pIdent, IAAFFile** ppFile);
AAFRESULT AAFFileOpenNewModify(const aafCharacter* pFileName, aafUInt32 modeFlags, aafProductIdentification_t* pIdent,
                               IAAFFile** ppFile);
AAFRESULT AAFFileOpenNewModifyEx(const aafCharacter* pFileName, const aafUID_t* pFileKind, aafUInt32 modeFlags,
                                 aafProductIdentification_t* pIdent, IAAFFile** ppFile);
AAFRESULT AAFFileOpenTransient(aafProductIdentification_t* pIdent, IAAFFile** ppFile);
AAFRESULT AAFFileIsAAFFile(const aafCharacter* pFileName, aafUID_t* pAAFFileKind, aafBool* pFileIsAAFFile);
AAFRESULT AAFRawStorageIsAAFFile(IAAFRawStorage* pRawStorage, aafUID_t* pAAFFileKind, aafBool* pRawStorageIsAAFFile);
AAFRESULT AAFFileIsAAFFileKind(const aafCharacter* pFileName, const aafUID_t* pAAFFileKind, aafBool* pFileIsAAFFile);
AAFRESULT AAFRawStorageIsAAFFileKind(IAAFRawStorage* pRawStorage, const aafUID_t* pAAFFileKind,
                                     aafBool* pRawStorageIsAAFFile);
AAFRESULT AAFGetPluginManager(IAAFPluginManager** ppPluginManager);
AAFRESULT AAFCreateRawStorageMemory(aafFileAccess_t access, IAAFRawStorage** ppNewRawStorage);
AAFRESULT AAFCreateRawStorageDisk(const aafCharacter* pFilename, aafFileExistence_t existence, aafFileAccess_t access,
                                  IAAFRawStorage** ppNewRawStorage);
AAFRESULT AAFCreateRawStorageCachedDisk(const aafCharacter* pFilename, aafFileExistence_t existence,
                                        aafFileAccess_t access, aafUInt32 pageCount, aafUInt32 pageSize,
                                        IAAFRawStorage** ppNewRawStorage);
AAFRESULT AAFCreateRawStorageCached(IAAFRawStorage* pRawStorage, aafUInt32 pageCount, aafUInt32 pageSize,
                                    IAAFRawStorage** ppNewRawStorage);
AAFRESULT AAFCreateRawStorageCached2(IAAFRawStorage* pRawStorage, aafUInt32 pageCount, aafUInt32 pageSize,
                                     IAAFCachePageAllocator* pCachePageAllocator, IAAFRawStorage** ppNewRawStorage);
AAFRESULT AAFCreateAAFFileOnRawStorage(IAAFRawStorage* pRawStorage, aafFileExistence_t existence,
                                       aafFileAccess_t access, const aafUID_t* pFileKind, aafUInt32 modeFlags,
                                       aafProductIdentification_t* pIdent, IAAFFile** ppNewFile);
AAFRESULT AAFSetProgressCallback(IAAFProgress* pProgress);
AAFRESULT AAFGetFileEncodings(IEnumAAFFileEncodings** ppFileEncodings);
AAFRESULT AAFSetDiagnosticOutput(IAAFDiagnosticOutput* pOutput);
AAFRESULT AAFGetLibraryVersion(aafProductVersion_t* pVersion);
AAFRESULT AAFGetLibraryPathNameBufLen(aafUInt32* pBufSize);
AAFRESULT AAFGetLibraryPathName(aafCharacter* pLibraryPathName, aafUInt32 bufSize);
AAFRESULT AAFResultToTextBufLen(AAFRESULT result, aafUInt32* pResultTextSize);
AAFRESULT AAFResultToText(AAFRESULT result, aafCharacter* pResultText, aafUInt32 resultTextSize);
}
