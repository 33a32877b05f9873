#pragma once
/// The class and data definitions that the clip builder needs, looked up in
/// one dictionary at their first use and kept for the life of this object.
/// A definition that cannot be looked up throws the text
/// "AAFRESULT_SUCCEEDED (hr)", which ends the build as TOV_E_UNEXPECTED.
#include "aaf/AAF.h"
#include "aafbuilder/IAAFSmartPointer.h"

class CAAFBuiltinDefs {
public:
    /// Keeps a reference to `dictionary`; a null one throws "_rep" at first use.
    explicit CAAFBuiltinDefs(IAAFDictionary* dictionary) : m_Dictionary(dictionary) {}

    /// Borrowed: valid as long as this object.
    IAAFClassDef* cdMasterMob() { return Class(m_MasterMob, AUID_AAFMasterMob); }
    IAAFClassDef* cdSourceMob() { return Class(m_SourceMob, AUID_AAFSourceMob); }
    IAAFClassDef* cdTapeDescriptor() { return Class(m_TapeDescriptor, AUID_AAFTapeDescriptor); }
    IAAFClassDef* cdImportDescriptor() { return Class(m_ImportDescriptor, AUID_AAFImportDescriptor); }
    IAAFClassDef* cdNetworkLocator() { return Class(m_NetworkLocator, AUID_AAFNetworkLocator); }
    IAAFClassDef* cdSequence() { return Class(m_Sequence, AUID_AAFSequence); }
    IAAFClassDef* cdTimecode() { return Class(m_Timecode, AUID_AAFTimecode); }
    IAAFClassDef* cdFiller() { return Class(m_Filler, AUID_AAFFiller); }
    IAAFDataDef* ddkAAFTimecode();

private:
    IAAFClassDef* Class(IAAFSmartPointer<IAAFClassDef>& held, const aafUID_t& id);

    IAAFSmartPointer<IAAFDictionary> m_Dictionary;
    IAAFSmartPointer<IAAFClassDef> m_MasterMob, m_SourceMob, m_TapeDescriptor, m_ImportDescriptor, m_NetworkLocator,
        m_Sequence, m_Timecode, m_Filler;
    IAAFSmartPointer<IAAFDataDef> m_TimecodeDef;
};
