#include "aafbuilder/TransientClip.h"

#include "aafbuilder/AddMovieMetaData.h"
#include "aafbuilder/ClipSteps.h"
#include "boundary/OrloRegInfo.h"
#include "identity/GetProductID.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

ZEBString WideCopy(const ZEBString& path) {
    ZEBString wide(path);
    wide.ConvertTo(kTOVUnicodeWCHAR);
    return wide;
}

IAAFFile* OpenFile() {
    _aafProductIdentification_t product;
    GetProductID(product, OrloRegInfo::kVersionMajor, OrloRegInfo::kVersionMinor, OrloRegInfo::kVersionPatch,
                 OrloRegInfo::kVersionBuild, OrloRegInfo::kVendorName, OrloRegInfo::kPluginName,
                 OrloRegInfo::kVersionWideText, OrloRegInfo::CompID_OrloReaderMovContainer);
    IAAFFile* file = nullptr;
    TOVCheck(AAFFileOpenTransient(&product, &file));
    return file;
}

IAAFSmartPointer<IAAFHeader> HeaderOf(IAAFFile* file) {
    IAAFSmartPointer<IAAFHeader> header;
    TOVCheck(IAAFSmartPointer<IAAFFile>(file)->GetHeader(&header));
    return header;
}

IAAFSmartPointer<IAAFDictionary> DictionaryOf(IAAFHeader* header) {
    IAAFSmartPointer<IAAFDictionary> dictionary;
    TOVCheck(header->GetDictionary(&dictionary));
    return dictionary;
}

// The tape descriptor on tape, else an import descriptor.
void AddTapeDescriptor(const OrloReader::Movie& movie, CAAFBuiltinDefs& defs, const ZEBString& path,
                       IAAFDictionary* dictionary, IAAFSourceMob* tape) {
    IAAFSmartPointer<IAAFEssenceDescriptor> essence;
    if (movie.IsMovieOnTape()) {
        IAAFSmartPointer<IAAFTapeDescriptor> descriptor;
        TOVCheck(
            defs.cdTapeDescriptor()->CreateInstance(IID_IAAFTapeDescriptor, reinterpret_cast<IUnknown**>(&descriptor)));
        TOVCheck(descriptor->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&essence)));
    } else {
        IAAFSmartPointer<IAAFImportDescriptor> descriptor;
        TOVCheck(defs.cdImportDescriptor()->CreateInstance(IID_IAAFImportDescriptor,
                                                           reinterpret_cast<IUnknown**>(&descriptor)));
        TOVCheck(descriptor->QueryInterface(IID_IAAFEssenceDescriptor, reinterpret_cast<void**>(&essence)));
    }
    AddDescriptorLocation(path, dictionary, essence);
    TOVCheck(IAAFSmartPointer<IAAFSourceMob>(tape)->SetEssenceDescriptor(essence));
}

}  // namespace

TransientClip::TransientClip(const OrloReader::Movie& movie, const ZEBString& path)
    : m_Path(WideCopy(path)),
      m_File(OpenFile()),
      m_Header(HeaderOf(m_File)),
      m_Dictionary(DictionaryOf(m_Header)),
      m_Defs(m_Dictionary),
      m_Master(m_Defs.cdMasterMob()),
      m_Tape(m_Defs.cdSourceMob()) {
    const aafMobID_t& id = movie.GetMobID();
    TOVCheck(m_Master.mob->SetMobID(id));
    TOVCheck(m_Tape.mob->SetMobID(WithInstanceHigh(id, kTapeMobInstance)));
    SetMobName(m_Master.mob, movie.GetMovieName());
    SetMobName(m_Tape.mob, movie.IsMovieOnTape() ? movie.GetMovieTapeName() : movie.GetMovieTapeID());
}

void TransientClip::Complete(OrloReader::Movie& movie, const std::vector<IAAFMob*>& fileMobs, IAAFFile** out) {
    AddTapeDescriptor(movie, m_Defs, m_Path, m_Dictionary, m_Tape.specific);
    AddMovieMetaData(m_Master.mob, &movie);
    // The Mobs enter the file only when whole.
    TOVCheck(m_Header->AddMob(m_Master.mob));
    for (IAAFMob* fileMob : fileMobs) TOVCheck(m_Header->AddMob(fileMob));
    TOVCheck(m_Header->AddMob(m_Tape.mob));
    *out = m_File;
}

}  // namespace Impl
}  // namespace ZEB
