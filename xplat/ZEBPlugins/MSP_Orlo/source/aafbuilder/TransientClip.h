#pragma once
/// What every clip of a Movie is built in: the transient AAF file, named as
/// the plug-in's, with its dictionary's definitions, the Master Mob and the
/// tape or import Source Mob.
#include <vector>

#include "aaf/AAF.h"
#include "aafbuilder/CAAFBuiltinDefs.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "aafbuilder/NewMob.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"

namespace ZEB {
namespace Impl {

class TransientClip {
public:
    /// Opens the file through the AAF library loader and makes the Master Mob
    /// (the Movie's identity and name) and the tape or import Mob (0xA1 in
    /// byte 13, the tape name on tape, else the tape ID). A failing step
    /// throws its result.
    TransientClip(const OrloReader::Movie& movie, const ZEBString& path);

    /// Gives the tape or import Mob its descriptor, located at the path, and
    /// the Master Mob the Movie's comments; adds the Master Mob, `fileMobs`
    /// and the tape or import Mob to the file, and hands the file to `*out`.
    void Complete(OrloReader::Movie& movie, const std::vector<IAAFMob*>& fileMobs, IAAFFile** out);

    /// The path in wide form.
    const ZEBString& Path() const { return m_Path; }
    IAAFDictionary* Dictionary() const { return m_Dictionary; }
    CAAFBuiltinDefs& Defs() { return m_Defs; }
    NewMob<IAAFMasterMob>& Master() { return m_Master; }
    NewMob<IAAFSourceMob>& Tape() { return m_Tape; }

private:
    ZEBString m_Path;
    /// Held plainly: a build that fails neither closes nor releases it, by
    /// design; the leak checker of the builder's tests lets go of what the
    /// opening allocates, and of nothing else.
    IAAFFile* m_File = nullptr;
    IAAFSmartPointer<IAAFHeader> m_Header;
    IAAFSmartPointer<IAAFDictionary> m_Dictionary;
    CAAFBuiltinDefs m_Defs;
    NewMob<IAAFMasterMob> m_Master;
    NewMob<IAAFSourceMob> m_Tape;
};

}  // namespace Impl
}  // namespace ZEB
