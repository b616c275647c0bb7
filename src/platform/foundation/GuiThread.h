// SPDX-License-Identifier: MIT
// Checks that a public operation runs on the application's own thread, and that there is an
// application.
#pragma once

namespace penwick::platform {

/// A fatal error unless this is the thread of the application object. Each public operation of
/// Penwick, of the controllers and of the windows calls it first; it costs one comparison. Passes
/// once the application object is destroyed, because objects of ours may outlive it.
void requireGuiThread();

/// Like requireGuiThread(), and also a fatal error unless the application object has widgets. The
/// constructors of the first objects of ours call it, so that the process ends with a line of ours
/// and not with one of the toolkit's.
void requireApplication();

/// For destructors: like requireGuiThread(), but passes where there is no application.
void requireGuiThreadAtEnd();

} // namespace penwick::platform
