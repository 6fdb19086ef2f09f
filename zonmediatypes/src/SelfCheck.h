#pragma once

namespace zonmediatypes
{

/// Puts the library's checks of itself into the host's registry (zoncore/CheckRegistry.h), as the suite
/// "ZON.MediaTypes".
void RegisterSelfChecks();

}   // namespace zonmediatypes
