// SPDX-License-Identifier: MIT
// The screen of the random sessions.
#pragma once

namespace penwick::test {

/// Lets the application that is made next come up on a screen that is not there, small so that
/// painting takes no time. What the toolkit would say of its absence at every step is not printed.
void useSmallScreen();

} // namespace penwick::test
