#pragma once
/// The product identity the console passes to the logging library.

extern "C" {
/// The product name ("Brimlo Tavi"). The texts live as long as the
/// process; each call refreshes its own text.
const char* ProductState_GetName();
/// The product version ("8.1.0").
const char* ProductState_GetVersion();
/// The build number as text ("24519031").
const char* ProductState_GetBuildNumberString();
/// The compilation option ("release" or "debug").
const char* ProductState_GetCompilationOption();
}
