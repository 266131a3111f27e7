#pragma once
/// The product identity the console passes to the logging library.

extern "C" {
const char* ProductState_GetName();
const char* ProductState_GetVersion();
const char* ProductState_GetBuildNumberString();
const char* ProductState_GetCompilationOption();
}
