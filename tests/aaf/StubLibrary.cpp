// A stand-in AAF library for the loader's tests. Each variant leaves out the
// entry points named by OMIT_<name>; the ones present answer kStubAnswer, so
// that a test sees its call arrive.
#include <stdexcept>

#include "aaf/AAF.h"

#define STUB_EXPORT extern "C" __attribute__((visibility("default")))

namespace {
constexpr AAFRESULT kStubAnswer = 0x00000123;
}

#ifndef OMIT_AAFFileOpenExistingRead
STUB_EXPORT AAFRESULT AAFFileOpenExistingRead(const aafCharacter*, aafUInt32, IAAFFile**) { return kStubAnswer; }
#endif
STUB_EXPORT AAFRESULT AAFFileOpenExistingModify(const aafCharacter*, aafUInt32, aafProductIdentification_t*,
                                                IAAFFile**) {
    return kStubAnswer;
}
STUB_EXPORT AAFRESULT AAFFileOpenNewModify(const aafCharacter*, aafUInt32, aafProductIdentification_t*, IAAFFile**) {
    return kStubAnswer;
}
#ifndef OMIT_AAFFileOpenNewModifyEx
STUB_EXPORT AAFRESULT AAFFileOpenNewModifyEx(const aafCharacter*, const aafUID_t*, aafUInt32,
                                             aafProductIdentification_t*, IAAFFile**) {
    return kStubAnswer;
}
#endif
#ifndef OMIT_AAFFileOpenTransient
STUB_EXPORT AAFRESULT AAFFileOpenTransient(aafProductIdentification_t*, IAAFFile**) { return kStubAnswer; }
#endif
// The published library answers not-implemented here for files it cannot read.
STUB_EXPORT AAFRESULT AAFFileIsAAFFile(const aafCharacter*, aafUID_t*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
STUB_EXPORT AAFRESULT AAFGetPluginManager(IAAFPluginManager**) { return kStubAnswer; }
#ifndef OMIT_AAFCreateRawStorageMemory
STUB_EXPORT AAFRESULT AAFCreateRawStorageMemory(aafFileAccess_t, IAAFRawStorage**) { return kStubAnswer; }
#endif
#ifndef OMIT_AAFCreateRawStorageDisk
STUB_EXPORT AAFRESULT AAFCreateRawStorageDisk(const aafCharacter*, aafFileExistence_t, aafFileAccess_t,
                                              IAAFRawStorage**) {
    return kStubAnswer;
}
#endif
STUB_EXPORT AAFRESULT AAFCreateAAFFileOnRawStorage(IAAFRawStorage*, aafFileExistence_t, aafFileAccess_t,
                                                   const aafUID_t*, aafUInt32, aafProductIdentification_t*,
                                                   IAAFFile**) {
    return kStubAnswer;
}
STUB_EXPORT AAFRESULT AAFGetLibraryVersion(aafProductVersion_t*) {
#ifdef THROW_FROM_VERSION
    throw std::runtime_error("thrown inside the library");
#else
    return kStubAnswer;
#endif
}
