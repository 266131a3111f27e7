#pragma once
/// The platform's preference library, initialised first thing at start-up.

extern "C" {
/// Initialises the platform. The simulated host also checks that it runs
/// under a scratch root (TULK_ROOT set and not "/") and loads the host
/// state; either failure prints one line on standard error and exits with
/// status 1, before the screen is touched.
void Preference_Init();
}
