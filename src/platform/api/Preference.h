#pragma once
/// The platform's preference library, initialised first thing at start-up.

extern "C" {
void Preference_Init();
}
