// SPDX-License-Identifier: MIT
// Who may call the public operations: the application's own thread, and where there is one.
#pragma once

namespace penwick::platform {

/// A fatal error unless this is the thread of the application object. Each public operation of the
/// entry object, of the controllers and of the windows asks first; it costs one comparison. Content
/// once the application object has been and is gone: objects of ours may outlive it and end then.
void requireGuiThread();

/// The same, and a fatal error too unless the application object is one that has widgets. What
/// constructs the first object of ours asks, before the toolkit says so in words of its own.
void requireApplication();

/// What a destructor asks: like requireGuiThread(), but content where the application is gone.
void requireGuiThreadAtEnd();

} // namespace penwick::platform
