#pragma once
// Numeric configuration: settings read from the process's configuration record with a default.
//
// The record is filled, on first use, from the file named by the environment variable
// GLOBKIT_CONFIG when the application has not named one with setConfigFile before. Code (and
// tests) may also change the record directly through processConfig().
//
// Reading a value: a missing key gives the default, silently. A value that does not parse as a
// whole (decimal integers with an optional sign; for doubles, the usual decimal and exponent
// forms), that is out of range for the type, or that is NaN or infinite gives the default and
// a diagnostic, once per record, key and bad value.
#include "platform/misc/configb.h"

// The process's configuration record.
configb& processConfig();
// Replaces the process's record with the contents of `path`. On failure the record is kept
// and false is returned (with a diagnostic).
bool setConfigFile(const String& path);
// Loads the file named by GLOBKIT_CONFIG into the process's record, as first use does. False
// when the variable is unset or empty or the file cannot be read (the record is then kept).
bool loadConfigFromEnvironment();

int config_int(const char* key, int def);
double config_double(const char* key, double def);

// The same rules applied to a given record.
int config_int(const configb& record, const char* key, int def);
double config_double(const configb& record, const char* key, double def);
