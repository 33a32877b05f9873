// A stand-in AAF library for the loader's tests. Each variant leaves out the
// entry points named by OMIT_<name>; the ones present answer kStubAnswer, so
// that a test sees its call arrive.
#include <stdexcept>

#include "aaf/AAF.h"

#define STUB_EXPORT extern "C" __attribute__((visibility("default")))
// An entry point that answers kStubAnswer.
#define STUB(name, params) \
    STUB_EXPORT AAFRESULT name params { return kStubAnswer; }

namespace {
constexpr AAFRESULT kStubAnswer = 0x00000123;
}

#ifndef OMIT_AAFFileOpenExistingRead
STUB(AAFFileOpenExistingRead, (const aafCharacter*, aafUInt32, IAAFFile**))
#endif
STUB(AAFFileOpenExistingModify, (const aafCharacter*, aafUInt32, aafProductIdentification_t*, IAAFFile**))
STUB(AAFFileOpenNewModify, (const aafCharacter*, aafUInt32, aafProductIdentification_t*, IAAFFile**))
#ifndef OMIT_AAFFileOpenNewModifyEx
STUB(AAFFileOpenNewModifyEx, (const aafCharacter*, const aafUID_t*, aafUInt32, aafProductIdentification_t*, IAAFFile**))
#endif
#ifndef OMIT_AAFFileOpenTransient
STUB(AAFFileOpenTransient, (aafProductIdentification_t*, IAAFFile**))
#endif
// The published library answers not-implemented here for files it cannot read.
STUB_EXPORT AAFRESULT AAFFileIsAAFFile(const aafCharacter*, aafUID_t*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
STUB(AAFGetPluginManager, (IAAFPluginManager**))
#ifndef OMIT_AAFCreateRawStorageMemory
STUB(AAFCreateRawStorageMemory, (aafFileAccess_t, IAAFRawStorage**))
#endif
#ifndef OMIT_AAFCreateRawStorageDisk
STUB(AAFCreateRawStorageDisk, (const aafCharacter*, aafFileExistence_t, aafFileAccess_t, IAAFRawStorage**))
#endif
STUB(AAFCreateAAFFileOnRawStorage, (IAAFRawStorage*, aafFileExistence_t, aafFileAccess_t, const aafUID_t*, aafUInt32,
                                    aafProductIdentification_t*, IAAFFile**))
STUB_EXPORT AAFRESULT AAFGetLibraryVersion(aafProductVersion_t*) {
#ifdef THROW_FROM_VERSION
    throw std::runtime_error("thrown inside the library");
#else
    return kStubAnswer;
#endif
}
