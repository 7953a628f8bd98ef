#include "gallery/MessageLog.h"

#include <cinttypes>

#include "platform/glob/Glob.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/misc/Diagnostics.h"

namespace {
// The view shows a screenful; the file keeps everything.
constexpr size_t kKeptEntries = 500;
int64_t gStartMs = 0;
}  // namespace

MessageLog::MessageLog() {
  gStartMs = RuntimeClock::now();
}

MessageLog::~MessageLog() {
  if (file_) std::fclose(file_);
}

bool MessageLog::attachFile(const String& path) {
  std::FILE* f = std::fopen(path.c_str(), "w");
  if (!f) {
    diagError("gallery: cannot write the message log to " + path + "\n");
    return false;
  }
  if (file_) std::fclose(file_);
  file_ = f;
  return true;
}

void MessageLog::record(const String& owner, const Event& e) {
  LogEntry entry;
  entry.timeMs = RuntimeClock::now() - gStartMs;
  entry.owner = owner;
  entry.text = e.text();
  entry.modifiers = e.word2;
  if (Glob* sender = e.senderIfAlive()) {
    entry.senderKind = sender->idstring();
    entry.senderName = sender->get_name();
  } else {
    entry.senderKind = "-";
  }
  add(std::move(entry));
}

void MessageLog::add(LogEntry entry) {
  ++total_;
  if (file_) {
    const String line = format(entry) + "\n";
    std::fputs(line.c_str(), file_);
    std::fflush(file_);
  }
  entries_.push_back(std::move(entry));
  if (entries_.size() > kKeptEntries) entries_.erase(entries_.begin());
  if (listener_) listener_();
}

namespace {
// One entry is one line: line breaks and other control characters are shown escaped.
String oneLine(const String& s) {
  String out;
  for (const char ch : s) {
    const auto c = static_cast<unsigned char>(ch);
    if (c == '\n') {
      out += "\\n";
    } else if (c < 32 || c == 127) {
      char hex[8];
      std::snprintf(hex, sizeof hex, "\\x%02X", c);
      out += hex;
    } else {
      out += ch;
    }
  }
  return out;
}
}  // namespace

String MessageLog::format(const LogEntry& e) {
  char time[32];
  std::snprintf(time, sizeof time, "%" PRId64 ".%03" PRId64, e.timeMs / 1000, e.timeMs % 1000);
  String line = String(time) + "  " + oneLine(e.owner) + "  " + oneLine(e.senderKind);
  if (!e.senderName.empty()) line += " \"" + oneLine(e.senderName) + "\"";
  line += "  \"" + oneLine(e.text) + "\"";
  if (e.modifiers) {
    char mods[24];
    std::snprintf(mods, sizeof mods, "  mods=0x%08X", e.modifiers);
    line += mods;
  }
  return line;
}
