#pragma once
/// An AAF file: its header, its dictionary and its life cycle.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFFile : public IUnknown {
public:
    virtual AAFRESULT Open() = 0;
    virtual AAFRESULT SaveCopyAs(IAAFFile* pDestFile) = 0;
    virtual AAFRESULT GetHeader(IAAFHeader** ppHeader) = 0;
    virtual AAFRESULT GetRevision(aafFileRev_t* pRev) = 0;
    virtual AAFRESULT Save() = 0;
    virtual AAFRESULT Close() = 0;
    virtual AAFRESULT GetDictionary(IAAFDictionary** ppDictionary) = 0;

protected:
    ~IAAFFile() = default;
};
AAF_INTERFACE_ID(IAAFFile);
