#include "aafbuilder/NewAAFFromMovie.h"

#include "aafbuilder/AAFFromMovie.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

TOVRESULT NewAAFFromMovie(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out,
                          ITOVComponentFactory* factory) {
    // A Movie gathered from sibling mono files will take a builder of its own,
    // which is not part of the plug-in yet: until the group scan makes such
    // Movies, every Movie is one file's, and AAFFromMovie refuses a null one.
    return TOVGuarded([&] { return AAFFromMovie(movie, path, out, factory); });
}

}  // namespace Impl
}  // namespace ZEB
