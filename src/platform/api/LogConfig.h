#pragma once
/// The platform's logging library. The console calls these in a fixed order
/// at start-up; what they do inside is the platform's business.

extern "C" {
/// Product identity: name, version, build number, compilation option.
void Log_SetProductInfo(const char* name, const char* version, const char* build,
                        const char* compilationOption);
/// The platform's logging configuration for the console.
void* Log_CfgInterface();
/// Initialises platform logging to the system log.
int Log_InitWithSyslogSimpleInt(const char* ident, void* config, const char* syslogIdent);
}
