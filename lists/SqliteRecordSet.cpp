#include "lists/SqliteRecordSet.h"

#include <unistd.h>

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <cmath>
#include <cstdlib>
#include <filesystem>

#include "platform/misc/Diagnostics.h"

namespace {

constexpr const char* kPrefix = "SqliteRecordSet: ";

String upper(String s) {
  for (char& c : s) c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
  return s;
}

bool contains(const String& s, const char* part) {
  return s.find(part) != String::npos;
}

// Prepares a statement that lives as long as the record set; null on failure.
sqlite3_stmt* prepare(sqlite3* db, const String& sql) {
  sqlite3_stmt* st = nullptr;
  if (sqlite3_prepare_v3(db, sql.c_str(), static_cast<int>(sql.size()), SQLITE_PREPARE_PERSISTENT,
                         &st, nullptr) != SQLITE_OK) {
    sqlite3_finalize(st);
    return nullptr;
  }
  return st;
}

// A whole number, nothing else (no spaces, no fraction).
bool parseInteger(const char* text, sqlite3_int64& out) {
  if (!*text || std::isspace(static_cast<unsigned char>(*text))) return false;
  errno = 0;
  char* end = nullptr;
  const long long v = std::strtoll(text, &end, 10);
  if (errno != 0 || *end != '\0') return false;
  out = v;
  return true;
}

bool parseNumber(const char* text, double& out) {
  if (!*text || std::isspace(static_cast<unsigned char>(*text))) return false;
  char* end = nullptr;
  const double v = std::strtod(text, &end);
  if (*end != '\0' || !std::isfinite(v)) return false;
  out = v;
  return true;
}

}  // namespace

SqliteRecordSet::SqliteRecordSet(const String& path, const String& table, const String& orderColumn)
    : table_(table), orderColumn_(orderColumn) {
  if (!open(path) || !readSchema() || !countRows() || !prepareSelect()) close();
}

SqliteRecordSet::~SqliteRecordSet() {
  close();
}

void SqliteRecordSet::fail(const String& what) {
  error_ = what;
  if (db_ && sqlite3_errcode(db_) != SQLITE_OK) error_ += ": " + String(sqlite3_errmsg(db_));
  diagWarning(kPrefix + error_ + "\n");
}

void SqliteRecordSet::close() {
  for (Field& f : fields_) sqlite3_finalize(f.update);
  fields_.clear();
  sqlite3_finalize(select_);
  sqlite3_finalize(setOrder_);
  sqlite3_finalize(minOrder_);
  select_ = setOrder_ = minOrder_ = nullptr;
  pages_.clear();
  rowCount_ = 0;
  writable_ = false;
  if (db_) sqlite3_close_v2(db_);
  db_ = nullptr;
}

bool SqliteRecordSet::open(const String& path) {
  std::error_code ec;
  if (path.empty() || !std::filesystem::is_regular_file(path, ec)) {
    fail("no database file at \"" + path + "\"");
    return false;
  }
  // A file marked read-only is taken as such even by a user who could write it anyway.
  const auto perms = std::filesystem::status(path, ec).permissions();
  const auto anyWrite = std::filesystem::perms::owner_write | std::filesystem::perms::group_write |
                        std::filesystem::perms::others_write;
  writable_ =
      ::access(path.c_str(), W_OK) == 0 && (perms & anyWrite) != std::filesystem::perms::none;
  const int flags = (writable_ ? SQLITE_OPEN_READWRITE : SQLITE_OPEN_READONLY);
  if (sqlite3_open_v2(path.c_str(), &db_, flags, nullptr) != SQLITE_OK) {
    fail("cannot open \"" + path + "\"");
    return false;
  }
  sqlite3_extended_result_codes(db_, 1);
  if (!writable_) diagWarning(kPrefix + String("\"") + path + "\" is read-only: changes refused\n");
  return true;
}

bool SqliteRecordSet::readSchema() {
  // The first read of the file: a corrupt file or one that is not a database fails here.
  sqlite3_stmt* st = prepare(db_, "SELECT 1 FROM sqlite_master WHERE type = 'table' AND name = ?1");
  if (!st) {
    fail("cannot read the schema");
    return false;
  }
  sqlite3_bind_text(st, 1, table_.c_str(), -1, SQLITE_TRANSIENT);
  const int found = sqlite3_step(st);
  sqlite3_finalize(st);
  if (found != SQLITE_ROW) {
    fail(found == SQLITE_DONE ? "no table \"" + table_ + "\"" : String("cannot read the schema"));
    return false;
  }

  st = prepare(db_, "SELECT name, type FROM pragma_table_info(?1) ORDER BY cid");
  if (!st) {
    fail("cannot read the columns of \"" + table_ + "\"");
    return false;
  }
  sqlite3_bind_text(st, 1, table_.c_str(), -1, SQLITE_TRANSIENT);
  while (sqlite3_step(st) == SQLITE_ROW) {
    const auto* name = reinterpret_cast<const char*>(sqlite3_column_text(st, 0));
    const auto* type = reinterpret_cast<const char*>(sqlite3_column_text(st, 1));
    const String n = name ? name : "";
    if (n == orderColumn_) {
      hasOrder_ = true;
      continue;
    }
    Field f;
    f.name = n;
    f.code = typeCodeOf(type ? type : "");
    fields_.push_back(std::move(f));
  }
  sqlite3_finalize(st);
  if (fields_.empty()) {
    fail("table \"" + table_ + "\" has no columns to show");
    return false;
  }
  return true;
}

bool SqliteRecordSet::countRows() {
  dense_ = false;
  if (hasOrder_ && !orderHasGaps_ && uniqueOrder() && countByKey()) return true;
  sqlite3_stmt* st = prepare(db_, "SELECT count(*) FROM " + quoted(table_));
  if (!st || sqlite3_step(st) != SQLITE_ROW) {
    sqlite3_finalize(st);
    fail("cannot count the rows of \"" + table_ + "\"");
    return false;
  }
  rowCount_ =
      static_cast<unsigned>(std::clamp<sqlite3_int64>(sqlite3_column_int64(st, 0), 0, 0x7FFFFFFF));
  sqlite3_finalize(st);
  return true;
}

bool SqliteRecordSet::uniqueOrder() {
  sqlite3_stmt* st =
      prepare(db_,
              "SELECT count(*) FROM pragma_index_list(?1) AS l, pragma_index_info(l.name) AS i "
              "WHERE l.\"unique\" = 1 AND i.name = ?2 AND "
              "(SELECT count(*) FROM pragma_index_info(l.name)) = 1");
  if (!st) return false;
  sqlite3_bind_text(st, 1, table_.c_str(), -1, SQLITE_TRANSIENT);
  sqlite3_bind_text(st, 2, orderColumn_.c_str(), -1, SQLITE_TRANSIENT);
  const bool unique = sqlite3_step(st) == SQLITE_ROW && sqlite3_column_int64(st, 0) > 0;
  sqlite3_finalize(st);
  return unique;
}

bool SqliteRecordSet::countByKey() {
  // Each of these is one walk down the index. With unique whole numbers from 0 and no NULLs,
  // the rows are 0..max, unless there are gaps: a page read by key finds those and falls back
  // to counting (loadPage).
  const String o = quoted(orderColumn_);
  const String t = quoted(table_);
  auto single = [&](const String& sql, sqlite3_int64& value, String& type) {
    sqlite3_stmt* st = prepare(db_, sql);
    bool ok = st && sqlite3_step(st) == SQLITE_ROW;
    if (ok) {
      value = sqlite3_column_int64(st, 0);
      type = sqlite3_column_type(st, 0) == SQLITE_INTEGER ? "integer" : "other";
    }
    sqlite3_finalize(st);
    return ok;
  };
  sqlite3_int64 lo = 0, hi = 0, nulls = 0;
  String loType, hiType, nullType;
  if (!single("SELECT min(" + o + ") FROM " + t, lo, loType) ||
      !single("SELECT max(" + o + ") FROM " + t, hi, hiType) ||
      !single("SELECT EXISTS (SELECT 1 FROM " + t + " WHERE " + o + " IS NULL)", nulls, nullType)) {
    return false;
  }
  if (loType != "integer" || hiType != "integer" || nulls != 0 || lo != 0 || hi >= 0x7FFFFFFF) {
    return false;
  }
  rowCount_ = static_cast<unsigned>(hi + 1);
  dense_ = true;
  return true;
}

bool SqliteRecordSet::prepareSelect() {
  sqlite3_finalize(select_);
  select_ = nullptr;
  String sql = "SELECT rowid, " + (hasOrder_ ? quoted(orderColumn_) : String("NULL"));
  for (const Field& f : fields_) sql += ", " + quoted(f.name);
  sql += " FROM " + quoted(table_);
  if (dense_) {
    sql += " WHERE " + quoted(orderColumn_) + " >= ?1 AND " + quoted(orderColumn_) + " < ?1 + ?2";
  }
  sql += " ORDER BY " + (hasOrder_ ? quoted(orderColumn_) + ", rowid" : String("rowid"));
  if (!dense_) sql += " LIMIT ?2 OFFSET ?1";
  select_ = prepare(db_, sql);
  if (!select_) {
    fail("cannot read the rows of \"" + table_ + "\"");
    return false;
  }
  return true;
}

void SqliteRecordSet::refresh() {
  if (!db_) return;
  pages_.clear();
  ++version_;
  orderHasGaps_ = false;  // perhaps mended meanwhile; a page read will tell
  if (!countRows() || !prepareSelect()) close();
}

char SqliteRecordSet::typeCodeOf(const String& declaredType) {
  const String t = upper(declaredType);
  if (contains(t, "INT")) return 'l';
  if (contains(t, "DATE") || contains(t, "TIME")) return 't';
  if (contains(t, "CLOB") || contains(t, "MEMO")) return 'M';
  if (contains(t, "CHAR")) return 'a';
  if (contains(t, "TEXT")) return 'A';
  if (t.empty() || contains(t, "BLOB")) return 'b';
  if (contains(t, "REAL") || contains(t, "FLOA") || contains(t, "DOUB") || contains(t, "NUM") ||
      contains(t, "DEC")) {
    return 'n';
  }
  return '?';
}

String SqliteRecordSet::quoted(const String& identifier) {
  String q = "\"";
  for (char c : identifier) {
    if (c == '"') q += '"';
    q += c;
  }
  return q + "\"";
}

const char* SqliteRecordSet::fieldName(unsigned int column) const {
  return column < fields_.size() ? fields_[column].name.c_str() : "";
}

char SqliteRecordSet::fieldTypeCode(unsigned int column) const {
  return column < fields_.size() ? fields_[column].code : '?';
}

const SqliteRecordSet::Page* SqliteRecordSet::pageOf(unsigned row) {
  const unsigned first = row / kPageRows * kPageRows;
  for (auto it = pages_.begin(); it != pages_.end(); ++it) {
    if (it->first == first) {
      pages_.splice(pages_.begin(), pages_, it);
      return &pages_.front();
    }
  }
  Page page;
  if (!loadPage(first, page)) return nullptr;
  pages_.push_front(std::move(page));
  if (pages_.size() > kCachedPages) pages_.pop_back();
  return &pages_.front();
}

bool SqliteRecordSet::loadPage(unsigned first, Page& page) {
  if (!select_) return false;
  page.first = first;
  sqlite3_reset(select_);
  sqlite3_bind_int64(select_, 1, first);
  sqlite3_bind_int64(select_, 2, kPageRows);
  const size_t columns = fields_.size();
  int rc = SQLITE_OK;
  while ((rc = sqlite3_step(select_)) == SQLITE_ROW) {
    page.rowids.push_back(sqlite3_column_int64(select_, 0));
    page.order.push_back(sqlite3_column_int64(select_, 1));
    for (size_t c = 0; c < columns; ++c) {
      const int col = static_cast<int>(c) + 2;
      if (sqlite3_column_type(select_, col) == SQLITE_BLOB) {
        page.cells.push_back("[" + std::to_string(sqlite3_column_bytes(select_, col)) + " bytes]");
      } else {
        const auto* t = reinterpret_cast<const char*>(sqlite3_column_text(select_, col));
        page.cells.emplace_back(t ? t : "");
      }
    }
  }
  sqlite3_reset(select_);
  if (rc != SQLITE_DONE) {
    fail("cannot read rows from " + std::to_string(first));
    return false;
  }
  ++pagesRead_;
  if (dense_ && !pageIsDense(page)) {
    // The order values have gaps: count the rows and find pages by counting from now on.
    orderHasGaps_ = true;
    pages_.clear();
    ++version_;
    if (!countRows() || !prepareSelect()) {
      close();
      return false;
    }
    page = Page();
    return loadPage(first, page);
  }
  return true;
}

bool SqliteRecordSet::pageIsDense(const Page& page) const {
  const unsigned expected = std::min(kPageRows, rowCount_ - std::min(rowCount_, page.first));
  if (page.order.size() != expected) return false;
  for (size_t i = 0; i < page.order.size(); ++i) {
    if (page.order[i] != static_cast<sqlite3_int64>(page.first + i)) return false;
  }
  return true;
}

const char* SqliteRecordSet::text(unsigned int row, unsigned int column) {
  if (row >= rowCount_ || column >= fields_.size()) return "";
  const Page* page = pageOf(row);
  if (!page || row - page->first >= page->rowids.size()) return "";
  return page->cells[(row - page->first) * fields_.size() + column].c_str();
}

void SqliteRecordSet::forgetRows(unsigned rowA, unsigned rowB) {
  pages_.remove_if([&](const Page& p) {
    return rowA / kPageRows * kPageRows == p.first || rowB / kPageRows * kPageRows == p.first;
  });
}

bool SqliteRecordSet::exec(const char* sql) {
  return sqlite3_exec(db_, sql, nullptr, nullptr, nullptr) == SQLITE_OK;
}

bool SqliteRecordSet::runInTransaction(const std::vector<sqlite3_stmt*>& statements) {
  if (!exec("BEGIN IMMEDIATE")) return false;
  for (sqlite3_stmt* st : statements) {
    const int rc = sqlite3_step(st);
    if (rc != SQLITE_DONE) {
      // Keep the message of the failing statement for the report before rolling back.
      const String why = sqlite3_errmsg(db_);
      for (sqlite3_stmt* s : statements) sqlite3_reset(s);
      exec("ROLLBACK");
      error_ = why;
      return false;
    }
  }
  for (sqlite3_stmt* s : statements) sqlite3_reset(s);
  if (!exec("COMMIT")) {
    const String why = sqlite3_errmsg(db_);
    exec("ROLLBACK");
    error_ = why;
    return false;
  }
  return true;
}

bool SqliteRecordSet::bindForField(sqlite3_stmt* st, int index, const Field& field,
                                   const char* text) {
  if (field.code == 'l' || field.code == 'n') {
    if (!*text) return sqlite3_bind_null(st, index) == SQLITE_OK;
    if (field.code == 'l') {
      sqlite3_int64 v = 0;
      if (!parseInteger(text, v)) return false;
      return sqlite3_bind_int64(st, index, v) == SQLITE_OK;
    }
    double v = 0;
    if (!parseNumber(text, v)) return false;
    return sqlite3_bind_double(st, index, v) == SQLITE_OK;
  }
  return sqlite3_bind_text(st, index, text, -1, SQLITE_TRANSIENT) == SQLITE_OK;
}

bool SqliteRecordSet::storeText(unsigned int row, unsigned int column, const char* text) {
  if (!db_ || !text || row >= rowCount_ || column >= fields_.size()) return false;
  Field& field = fields_[column];
  if (!writable_) {
    fail("\"" + field.name + "\" of row " + std::to_string(row) + " not stored: read-only file");
    return false;
  }
  const Page* page = pageOf(row);
  if (!page || row - page->first >= page->rowids.size()) return false;
  const sqlite3_int64 rowid = page->rowids[row - page->first];
  if (!field.update) {
    field.update = prepare(
        db_, "UPDATE " + quoted(table_) + " SET " + quoted(field.name) + " = ?1 WHERE rowid = ?2");
    if (!field.update) {
      fail("cannot write \"" + field.name + "\"");
      return false;
    }
  }
  sqlite3_reset(field.update);
  if (!bindForField(field.update, 1, field, text)) {
    sqlite3_clear_bindings(field.update);
    error_ = "\"" + String(text) + "\" is not a value for \"" + field.name + "\"";
    diagWarning(kPrefix + error_ + "\n");
    return false;
  }
  sqlite3_bind_int64(field.update, 2, rowid);
  const bool stored = runInTransaction({field.update});
  sqlite3_clear_bindings(field.update);
  forgetRows(row, row);
  if (!stored) {
    error_ = "\"" + field.name + "\" of row " + std::to_string(row) + " not stored: " + error_;
    diagWarning(kPrefix + error_ + "\n");
    return false;
  }
  error_.clear();
  return true;
}

bool SqliteRecordSet::swapRows(unsigned int rowA, unsigned int rowB) {
  if (!db_ || rowA >= rowCount_ || rowB >= rowCount_) return false;
  if (rowA == rowB) return true;
  if (!hasOrder_ || !writable_) {
    fail(String("rows not swapped: ") +
         (hasOrder_ ? "read-only file" : "no order column \"" + orderColumn_ + "\""));
    return false;
  }
  const Page* pa = pageOf(rowA);
  if (!pa || rowA - pa->first >= pa->rowids.size()) return false;
  const sqlite3_int64 idA = pa->rowids[rowA - pa->first];
  const sqlite3_int64 orderA = pa->order[rowA - pa->first];
  const Page* pb = pageOf(rowB);
  if (!pb || rowB - pb->first >= pb->rowids.size()) return false;
  const sqlite3_int64 idB = pb->rowids[rowB - pb->first];
  const sqlite3_int64 orderB = pb->order[rowB - pb->first];

  if (!setOrder_) {
    setOrder_ = prepare(db_, "UPDATE " + quoted(table_) + " SET " + quoted(orderColumn_) +
                                 " = ?1 WHERE rowid = ?2");
    minOrder_ = prepare(db_, "SELECT min(" + quoted(orderColumn_) + ") FROM " + quoted(table_));
    if (!setOrder_ || !minOrder_) {
      fail("cannot reorder rows");
      return false;
    }
  }
  // Through a value no row has, so that a unique order column never sees two equal values.
  sqlite3_int64 spare = -1;
  if (sqlite3_step(minOrder_) == SQLITE_ROW) spare = sqlite3_column_int64(minOrder_, 0) - 1;
  sqlite3_reset(minOrder_);

  auto set = [&](sqlite3_stmt* st, sqlite3_int64 order, sqlite3_int64 id) {
    sqlite3_bind_int64(st, 1, order);
    sqlite3_bind_int64(st, 2, id);
  };
  bool ok = exec("BEGIN IMMEDIATE");
  const std::pair<sqlite3_int64, sqlite3_int64> steps[] = {
      {spare, idA}, {orderA, idB}, {orderB, idA}};
  for (const auto& [order, id] : steps) {
    if (!ok) break;
    set(setOrder_, order, id);
    ok = sqlite3_step(setOrder_) == SQLITE_DONE;
    sqlite3_reset(setOrder_);
  }
  String why = ok ? String() : String(sqlite3_errmsg(db_));
  if (ok && !exec("COMMIT")) {
    ok = false;
    why = sqlite3_errmsg(db_);
  }
  if (!ok) exec("ROLLBACK");
  forgetRows(rowA, rowB);
  if (!ok) {
    error_ =
        "rows " + std::to_string(rowA) + " and " + std::to_string(rowB) + " not swapped: " + why;
    diagWarning(kPrefix + error_ + "\n");
    return false;
  }
  ++version_;
  error_.clear();
  return true;
}
