#include "platform/misc/Config.h"

#include <charconv>
#include <cmath>
#include <cstdlib>
#include <set>

#include "platform/misc/Diagnostics.h"

namespace {

struct ProcessConfig {
  configb record;
  bool initialised = false;
  // "key\0value" pairs already reported, so that a setting read often does not flood the log.
  std::set<String> reported;
};

ProcessConfig& state() {
  static ProcessConfig s;
  return s;
}

void reportOnce(const char* key, const String& value, const char* problem, const String& def) {
  String id = String(key) + '\0' + value;
  if (!state().reported.insert(std::move(id)).second) return;
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

// The value without surrounding blanks and with one leading '+' dropped: from_chars accepts a
// '-' sign only.
std::string_view numberText(const String& value) {
  std::string_view s = value;
  const auto blank = [](char c) { return c == ' ' || c == '\t'; };
  while (!s.empty() && blank(s.front())) s.remove_prefix(1);
  while (!s.empty() && blank(s.back())) s.remove_suffix(1);
  if (s.size() > 1 && s.front() == '+' && s[1] != '-' && s[1] != '+') s.remove_prefix(1);
  return s;
}

template <typename T>
bool parseWhole(std::string_view s, T& out, std::errc& ec) {
  const auto [end, err] = std::from_chars(s.data(), s.data() + s.size(), out);
  ec = err;
  return err == std::errc() && end == s.data() + s.size() && !s.empty();
}

String formatDouble(double v) {
  char buf[32];
  const auto [end, ec] = std::to_chars(buf, buf + sizeof buf, v);
  return ec == std::errc() ? String(buf, end) : String("?");
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
  int out = 0;
  std::errc ec{};
  if (parseWhole(numberText(*value), out, ec)) return out;
  const char* problem =
      ec == std::errc::result_out_of_range ? "is out of range" : "is not an integer";
  reportOnce(key, *value, problem, std::to_string(def));
  return def;
}

double config_double(const configb& record, const char* key, double def) {
  const String* value = lookUp(record, key);
  if (value == nullptr) return def;
  double out = 0;
  std::errc ec{};
  if (parseWhole(numberText(*value), out, ec)) {
    if (std::isfinite(out)) return out;
    reportOnce(key, *value, "is not finite", formatDouble(def));
    return def;
  }
  const char* problem =
      ec == std::errc::result_out_of_range ? "is out of range" : "is not a number";
  reportOnce(key, *value, problem, formatDouble(def));
  return def;
}

int config_int(const char* key, int def) {
  return config_int(processConfig(), key, def);
}

double config_double(const char* key, double def) {
  return config_double(processConfig(), key, def);
}
