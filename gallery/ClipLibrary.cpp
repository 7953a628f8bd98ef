#include "gallery/ClipLibrary.h"

#include <sqlite3.h>

#include <cstdlib>
#include <filesystem>

#include "platform/misc/Diagnostics.h"

namespace {
constexpr const char* kFile = "sample-clips.db";
const char* const kTags[] = {"interview", "b-roll", "music", "archive", "voice-over"};
const char* const kWords[] = {"Harbour", "Morning", "Street", "Studio", "Market", "Forest",
                              "Bridge",  "Rooftop", "Train",  "Beach",  "Night",  "Crowd"};
}  // namespace

String ClipLibrary::dataFolder() {
  if (const char* xdg = std::getenv("XDG_DATA_HOME"); xdg && *xdg) return String(xdg) + "/globkit";
  if (const char* home = std::getenv("HOME"); home && *home) {
    return String(home) + "/.local/share/globkit";
  }
  return String();
}

bool ClipLibrary::createSample(const String& path, int rows) {
  sqlite3* db = nullptr;
  if (sqlite3_open_v2(path.c_str(), &db, SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE, nullptr) !=
      SQLITE_OK) {
    diagWarning("ClipLibrary: cannot make \"" + path + "\": " + sqlite3_errmsg(db) + "\n");
    sqlite3_close(db);
    return false;
  }
  bool ok = sqlite3_exec(db,
                         "CREATE TABLE clips (name TEXT NOT NULL, duration REAL CHECK "
                         "(duration >= 0), date DATE, tags VARCHAR(32), position INTEGER);"
                         "CREATE UNIQUE INDEX clips_position ON clips(position);"
                         "BEGIN;",
                         nullptr, nullptr, nullptr) == SQLITE_OK;
  sqlite3_stmt* insert = nullptr;
  ok = ok && sqlite3_prepare_v2(db, "INSERT INTO clips VALUES (?1, ?2, ?3, ?4, ?5)", -1, &insert,
                                nullptr) == SQLITE_OK;
  for (int i = 0; ok && i < rows; ++i) {
    const String name =
        String(kWords[i % 12]) + " " + kWords[(i / 12) % 12] + " " + std::to_string(i + 1);
    char date[16];
    std::snprintf(date, sizeof date, "20%02d-%02d-%02d", 10 + i % 15, 1 + i % 12, 1 + i % 28);
    sqlite3_bind_text(insert, 1, name.c_str(), -1, SQLITE_TRANSIENT);
    sqlite3_bind_double(insert, 2, 2.0 + (i * 7919 % 36000) / 10.0);
    sqlite3_bind_text(insert, 3, date, -1, SQLITE_TRANSIENT);
    sqlite3_bind_text(insert, 4, kTags[i % 5], -1, SQLITE_STATIC);
    sqlite3_bind_int(insert, 5, i);
    ok = sqlite3_step(insert) == SQLITE_DONE;
    sqlite3_reset(insert);
  }
  sqlite3_finalize(insert);
  ok = ok && sqlite3_exec(db, "COMMIT", nullptr, nullptr, nullptr) == SQLITE_OK;
  if (!ok) diagWarning("ClipLibrary: sample not written: " + String(sqlite3_errmsg(db)) + "\n");
  sqlite3_close(db);
  if (!ok) std::filesystem::remove(path);
  return ok;
}

ClipLibrary::ClipLibrary(Canvas* parent) : Glob(GlobCreationInfo(0, 0, parent)) {
  unmap_canvas();
  const String folder = dataFolder();
  const String path = folder.empty() ? String() : folder + "/" + kFile;
  std::error_code ec;
  if (!path.empty() && !std::filesystem::exists(path, ec)) {
    std::filesystem::create_directories(folder, ec);
    createSample(path, kSampleClips);
  }
  records_ = std::make_unique<SqliteRecordSet>(path, "clips");
  supplier_ = std::make_unique<ClipSupplier>(*records_);
}

ClipLibrary::~ClipLibrary() = default;
