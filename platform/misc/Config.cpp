#include "platform/misc/Config.h"

#include <cstdlib>

#include "platform/misc/Diagnostics.h"
#include "platform/misc/NumberText.h"

namespace {

struct ProcessConfig {
  configb record;
  bool initialised = false;
};

ProcessConfig& state() {
  static ProcessConfig s;
  return s;
}

void reportOnce(const configb& record, const char* key, const String& value, const char* problem,
                const String& def) {
  if (!record.firstReportOf(key, value)) return;
  diagWarning(String("config: ") + key + " = '" + value + "' " + problem + "; using " + def);
}

// The value of `key`, or null when the key is null or missing.
const String* lookUp(const configb& record, const char* key) {
  if (key == nullptr) {
    diagWarning("config: null key; using the default");
    return nullptr;
  }
  return record.find(key);
}

}  // namespace

configb& processConfig() {
  if (!state().initialised) loadConfigFromEnvironment();
  return state().record;
}

bool loadConfigFromEnvironment() {
  ProcessConfig& s = state();
  s.initialised = true;
  const char* env = std::getenv("GLOBKIT_CONFIG");
  if (env == nullptr || env[0] == '\0') return false;
  return s.record.loadFile(env);
}

bool setConfigFile(const String& path) {
  ProcessConfig& s = state();
  s.initialised = true;
  return s.record.loadFile(path);
}

int config_int(const configb& record, const char* key, int def) {
  const String* value = lookUp(record, key);
  if (value == nullptr) return def;
  int out = def;
  const NumberText::Result r = NumberText::parse(*value, out);
  if (r != NumberText::Result::Ok) {
    reportOnce(record, key, *value, NumberText::describe(r), std::to_string(def));
  }
  return out;
}

double config_double(const configb& record, const char* key, double def) {
  const String* value = lookUp(record, key);
  if (value == nullptr) return def;
  double out = def;
  const NumberText::Result r = NumberText::parse(*value, out);
  if (r != NumberText::Result::Ok) {
    reportOnce(record, key, *value, NumberText::describe(r), NumberText::format(def));
  }
  return out;
}

int config_int(const char* key, int def) {
  return config_int(processConfig(), key, def);
}

double config_double(const char* key, double def) {
  return config_double(processConfig(), key, def);
}
