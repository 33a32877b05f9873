#include "aafbuilder/NewAAFFromMovie.h"

#include "aafbuilder/AAFFromMovie.h"
#include "aafbuilder/AAFFromMovieWithGrouping.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

TOVRESULT NewAAFFromMovie(OrloReader::Movie* movie, const ZEBString& path, IAAFFile** out,
                          ITOVComponentFactory* factory) {
    return TOVGuarded([&] {
        // A null Movie is no group; AAFFromMovie refuses it.
        if (movie != nullptr && movie->IsMonophonicGroup()) return AAFFromMovieWithGrouping(movie, path, out, factory);
        return AAFFromMovie(movie, path, out, factory);
    });
}

}  // namespace Impl
}  // namespace ZEB
