#pragma once
/// The work that an accepted chunk needs from the chunks before it.
namespace Orlo {

class OrloStream;

/// `data`: sample size and count from `fmt `, byte order from the file.
/// `COMM`: the data byte order, inverted for "sowt". `SSND`: the sample size
/// from `COMM`. Other types: nothing.
void PerformAdditionalInitialization(OrloStream& stream, unsigned int type);

}  // namespace Orlo
