#include "ClipDump.h"

#include <sstream>

#include "ResultText.h"
#include "aaf/dumpAAF.h"

TOVRESULT DumpClip(IAAFFile* file, bool json, bool noClock, std::string& out) {
    ZEB::AAFDumpOptions options;
    options.format = json ? ZEB::AAFDumpOptions::Format::JSON : ZEB::AAFDumpOptions::Format::Text;
    options.omitClock = noClock;
    std::ostringstream dump;
    const TOVRESULT result = ZEB::dumpAAF(file, dump, options);
    if (result != TOV_OK) return SayRefused(result, "the clip could not be read back");
    out = dump.str();
    return TOV_OK;
}
