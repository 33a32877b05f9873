#include "boundary/NewMovieFromFilePath.h"

#include <memory>

#include "boundary/AudioImportSettings.h"
#include "tov/IHostSettings.h"
#include "tov/TOVResult.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace Impl {

TOVRESULT NewMovieFromFilePath(const ZEBString& path, OrloReader::Movie** out, ITOVComponentFactory* factory) {
    return TOVGuarded([&] {
        bool allowGrouping = true;
        TOVPtr<IHostSettings> settings;
        GetAudioImportSettings(factory, settings, allowGrouping);
        if (path.IsEmpty()) throw static_cast<int>(TOV_E_INVALIDARG);
        auto movie = std::make_unique<OrloReader::Movie>();
        const TOVRESULT result = movie->InitFromFile(path, factory, allowGrouping);
        // Any result but 0 fails here, a positive one too.
        if (result != TOV_OK) {
            *out = nullptr;
            return result;
        }
        *out = movie.release();
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
