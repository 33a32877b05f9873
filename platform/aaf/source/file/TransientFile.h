#pragma once
/// An in-memory AAF file: a header with its content storage, dictionary and
/// identification, over a schema of its own. Nothing is ever written to disk.
#include "../core/ModelObject.h"
#include "../core/RefPtr.h"
#include "aaf/IAAFFile.h"

namespace aafmodel {

class Schema;

class TransientFile final : public IAAFFile {
public:
    /// A new open file, with one reference for the caller; throws a result on failure.
    static IAAFFile* Create(const aafProductIdentification_t& ident);

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override;
    aafUInt32 AddRef() override { return ++m_refs; }
    aafUInt32 Release() override;

    AAFRESULT Open() override;
    AAFRESULT SaveCopyAs(IAAFFile* pDestFile) override;
    AAFRESULT GetHeader(IAAFHeader** ppHeader) override;
    AAFRESULT GetRevision(aafFileRev_t* pRev) override;
    AAFRESULT Save() override;
    AAFRESULT Close() override;
    AAFRESULT GetDictionary(IAAFDictionary** ppDictionary) override;

private:
    explicit TransientFile(RefPtr<ModelObject> header) : m_header(std::move(header)) {}
    ~TransientFile() = default;

    aafUInt32 m_refs = 0;
    RefPtr<ModelObject> m_header;  // null once closed
};

}  // namespace aafmodel
