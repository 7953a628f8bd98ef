#include <gtest/gtest.h>
#include <sqlite3.h>

#include <filesystem>

#include "lists/OledbDataSupplier.h"
#include "lists/SqliteRecordSet.h"
#include "platform/misc/Diagnostics.h"
#include "tests/platform/TempDir.h"

namespace {

// Runs SQL on a database file of its own (made when missing), outside the record set.
void run(const String& path, const String& sql) {
  sqlite3* db = nullptr;
  ASSERT_EQ(sqlite3_open(path.c_str(), &db), SQLITE_OK);
  char* err = nullptr;
  const int rc = sqlite3_exec(db, sql.c_str(), nullptr, nullptr, &err);
  EXPECT_EQ(rc, SQLITE_OK) << (err ? err : "");
  sqlite3_free(err);
  sqlite3_close(db);
}

// One text read outside the record set.
String query(const String& path, const String& sql) {
  sqlite3* db = nullptr;
  sqlite3_open(path.c_str(), &db);
  sqlite3_stmt* st = nullptr;
  String out = "<error>";
  if (sqlite3_prepare_v2(db, sql.c_str(), -1, &st, nullptr) == SQLITE_OK &&
      sqlite3_step(st) == SQLITE_ROW) {
    const auto* t = reinterpret_cast<const char*>(sqlite3_column_text(st, 0));
    out = t ? t : "<null>";
  }
  sqlite3_finalize(st);
  sqlite3_close(db);
  return out;
}

struct SqliteRecordSetTest : ::testing::Test {
  // `rows` clips named clip0.. in position order, the reverse of their insertion order, so
  // that the order column visibly decides.
  void makeClips(int rows, bool uniquePositions = true) {
    String sql =
        "CREATE TABLE clips (name TEXT, duration REAL CHECK (duration >= 0), taken DATE, "
        "takes INTEGER, tags VARCHAR(40), position INTEGER);";
    sql += uniquePositions ? "CREATE UNIQUE INDEX clips_position ON clips(position);"
                           : "CREATE INDEX clips_position ON clips(position);";
    sql += "BEGIN;";
    for (int i = rows - 1; i >= 0; --i) {
      sql += "INSERT INTO clips VALUES ('clip" + std::to_string(i) + "', " + std::to_string(i) +
             ".5, '2024-01-0" + std::to_string(i % 9 + 1) + "', " + std::to_string(i) +
             ", 'tag', " + std::to_string(i) + ");";
    }
    sql += "COMMIT;";
    run(db, sql);
  }

  TempDir dir;
  String db = dir.file("clips.db");
  Diagnostics::Capture diag;
};

}  // namespace

TEST_F(SqliteRecordSetTest, SchemaTypesAndOrderedRows) {
  makeClips(300);
  SqliteRecordSet rs(db, "clips");
  ASSERT_TRUE(rs.isOpen()) << rs.lastError();
  EXPECT_TRUE(rs.isWritable());
  EXPECT_TRUE(rs.hasOrderColumn());
  EXPECT_TRUE(rs.readsByKey());
  EXPECT_EQ(rs.rowCount(), 300u);
  ASSERT_EQ(rs.fieldCount(), 5u);  // the order column is not shown
  EXPECT_STREQ(rs.fieldName(0), "name");
  EXPECT_STREQ(rs.fieldName(4), "tags");
  EXPECT_STREQ(rs.fieldName(5), "");
  EXPECT_EQ(String({rs.fieldTypeCode(0), rs.fieldTypeCode(1), rs.fieldTypeCode(2),
                    rs.fieldTypeCode(3), rs.fieldTypeCode(4)}),
            "Ant"
            "la");
  EXPECT_STREQ(rs.text(0, 0), "clip0");
  EXPECT_STREQ(rs.text(299, 0), "clip299");
  EXPECT_STREQ(rs.text(150, 1), "150.5");
  EXPECT_STREQ(rs.text(300, 0), "");  // beyond the rows
  EXPECT_STREQ(rs.text(0, 9), "");

  OledbDataSupplier s(rs);
  EXPECT_EQ(s.getFieldType(XY<int>(3, 0)), DataSupplier::NumberField);
  EXPECT_EQ(s.getFieldType(XY<int>(2, 0)), DataSupplier::TimeField);
  EXPECT_TRUE(diag.lines().empty());
}

TEST_F(SqliteRecordSetTest, OpeningReadsNoRowsAndRowsArriveAPageAtATime) {
  makeClips(1000);
  SqliteRecordSet rs(db, "clips");
  EXPECT_EQ(rs.pagesRead(), 0u);
  EXPECT_STREQ(rs.text(999, 0), "clip999");
  EXPECT_STREQ(rs.text(999 / SqliteRecordSet::kPageRows * SqliteRecordSet::kPageRows, 0),
               "clip896");
  EXPECT_EQ(rs.pagesRead(), 1u);
  EXPECT_STREQ(rs.text(500, 0), "clip500");
  EXPECT_EQ(rs.pagesRead(), 2u);
}

TEST_F(SqliteRecordSetTest, RowsWithoutAUniqueOrderAreStillInOrder) {
  makeClips(300, false);
  SqliteRecordSet rs(db, "clips");
  EXPECT_FALSE(rs.readsByKey());
  EXPECT_STREQ(rs.text(0, 0), "clip0");
  EXPECT_STREQ(rs.text(257, 0), "clip257");
  EXPECT_TRUE(rs.swapRows(0, 257));
  EXPECT_STREQ(rs.text(0, 0), "clip257");
}

TEST_F(SqliteRecordSetTest, HostileTextIsStoredAndReadBackUnchanged) {
  makeClips(5);
  const String hostile[] = {"O'Brien's \"quoted\" clip",
                            "x'); DROP TABLE clips; --",
                            "; ; ;",
                            "SELECT * FROM sqlite_master WHERE 1=1 OR ''=''",
                            "\xe2\x80\x9csmart\xe2\x80\x9d \\ %_",
                            ""};
  {
    SqliteRecordSet rs(db, "clips");
    for (size_t i = 0; i < std::size(hostile); ++i) {
      EXPECT_TRUE(rs.storeText(static_cast<unsigned>(i % 5), 0, hostile[i].c_str()));
      EXPECT_EQ(rs.text(static_cast<unsigned>(i % 5), 0), hostile[i]);
    }
  }
  SqliteRecordSet again(db, "clips");
  EXPECT_EQ(again.rowCount(), 5u);
  EXPECT_EQ(String(again.text(1, 0)), hostile[1]);
  EXPECT_EQ(String(again.text(0, 0)), hostile[5]);
  EXPECT_EQ(query(db, "SELECT count(*) FROM sqlite_master WHERE name = 'clips'"), "1");
}

TEST_F(SqliteRecordSetTest, TextThatDoesNotFitTheTypeIsRefused) {
  makeClips(3);
  SqliteRecordSet rs(db, "clips");
  EXPECT_FALSE(rs.storeText(1, 3, "many"));  // integer column
  EXPECT_FALSE(rs.storeText(1, 3, "2.5"));
  EXPECT_FALSE(rs.storeText(1, 3, " 7"));
  EXPECT_FALSE(rs.storeText(1, 1, "nan"));  // number column
  EXPECT_FALSE(rs.storeText(1, 1, "1e999"));
  EXPECT_STREQ(rs.text(1, 3), "1");
  EXPECT_TRUE(diag.contains("is not a value for \"takes\""));
  EXPECT_TRUE(rs.storeText(1, 3, "-12"));
  EXPECT_TRUE(rs.storeText(1, 1, "2.25"));
  EXPECT_TRUE(rs.storeText(2, 1, ""));  // empty is NULL
  EXPECT_EQ(query(db, "SELECT takes FROM clips WHERE position = 1"), "-12");
  EXPECT_EQ(query(db, "SELECT duration FROM clips WHERE position = 2"), "<null>");
  EXPECT_FALSE(rs.storeText(9, 0, "beyond"));
  EXPECT_FALSE(rs.storeText(0, 9, "beyond"));
}

TEST_F(SqliteRecordSetTest, AFailingStoreLeavesTheDatabaseUnchangedAndIsReported) {
  makeClips(3);
  run(db,
      "CREATE TABLE log (what TEXT);"
      "CREATE TRIGGER audit BEFORE UPDATE OF name ON clips BEGIN "
      "  INSERT INTO log VALUES ('renamed');"
      "  SELECT RAISE(ABORT, 'names are frozen') WHERE NEW.name = 'frozen';"
      "END;");
  SqliteRecordSet rs(db, "clips");
  EXPECT_FALSE(rs.storeText(0, 0, "frozen"));  // the trigger's own insert is undone too
  EXPECT_NE(rs.lastError().find("names are frozen"), String::npos) << rs.lastError();
  EXPECT_TRUE(diag.contains("names are frozen"));
  EXPECT_STREQ(rs.text(0, 0), "clip0");
  EXPECT_EQ(query(db, "SELECT count(*) FROM log"), "0");
  EXPECT_FALSE(rs.storeText(0, 1, "-3"));  // the CHECK constraint
  EXPECT_EQ(query(db, "SELECT duration FROM clips WHERE position = 0"), "0.5");
  EXPECT_TRUE(rs.storeText(0, 0, "thawed"));
  EXPECT_TRUE(rs.lastError().empty());
  EXPECT_EQ(query(db, "SELECT count(*) FROM log"), "1");
}

TEST_F(SqliteRecordSetTest, SwapsGoThroughTheOrderColumn) {
  makeClips(300);
  SqliteRecordSet rs(db, "clips");
  const unsigned long v = rs.version();
  EXPECT_TRUE(rs.swapRows(3, 3));  // with itself: nothing happens
  EXPECT_EQ(rs.version(), v);
  EXPECT_FALSE(rs.swapRows(3, 300));  // past the end
  EXPECT_FALSE(rs.swapRows(300, 3));
  EXPECT_EQ(rs.version(), v);

  EXPECT_TRUE(rs.swapRows(2, 290));  // rows of two pages
  EXPECT_NE(rs.version(), v);
  EXPECT_STREQ(rs.text(2, 0), "clip290");
  EXPECT_STREQ(rs.text(290, 0), "clip2");
  EXPECT_EQ(query(db, "SELECT name FROM clips WHERE position = 2"), "clip290");
  EXPECT_EQ(query(db, "SELECT count(DISTINCT position) FROM clips"), "300");

  SqliteRecordSet reopened(db, "clips");
  EXPECT_TRUE(reopened.readsByKey());  // still 0..rows-1
  EXPECT_STREQ(reopened.text(290, 0), "clip2");
}

TEST_F(SqliteRecordSetTest, ATableWithoutOrderColumnShowsRowsButRefusesSwaps) {
  run(db, "CREATE TABLE notes (body TEXT); INSERT INTO notes VALUES ('one'), ('two');");
  SqliteRecordSet rs(db, "notes");
  EXPECT_FALSE(rs.hasOrderColumn());
  EXPECT_EQ(rs.rowCount(), 2u);
  EXPECT_STREQ(rs.text(1, 0), "two");
  EXPECT_FALSE(rs.swapRows(0, 1));
  EXPECT_TRUE(diag.contains("no order column"));
  EXPECT_STREQ(rs.text(0, 0), "one");
}

TEST_F(SqliteRecordSetTest, BadFilesAndNamesGiveAnEmptyRecordSet) {
  makeClips(3);
  const auto expectEmpty = [](SqliteRecordSet& rs) {
    EXPECT_FALSE(rs.isOpen());
    EXPECT_EQ(rs.rowCount(), 0u);
    EXPECT_EQ(rs.fieldCount(), 0u);
    EXPECT_STREQ(rs.text(0, 0), "");
    EXPECT_FALSE(rs.storeText(0, 0, "x"));
    EXPECT_FALSE(rs.swapRows(0, 1));
    EXPECT_FALSE(rs.lastError().empty());
  };
  {
    SqliteRecordSet missing(dir.file("nowhere.db"), "clips");
    expectEmpty(missing);
    EXPECT_TRUE(diag.contains("no database file"));
    EXPECT_FALSE(std::filesystem::exists(dir.file("nowhere.db")));  // not made either
  }
  {
    const String corrupt = dir.file("corrupt.db");
    TempDir::write(corrupt, String(4096, 'x') + "not a database at all");
    SqliteRecordSet bad(corrupt, "clips");
    expectEmpty(bad);
    EXPECT_TRUE(diag.contains("not a database"));
  }
  {
    SqliteRecordSet injected(db, "clips\"; DROP TABLE clips; --");
    expectEmpty(injected);
    EXPECT_EQ(query(db, "SELECT count(*) FROM clips"), "3");
  }
}

TEST_F(SqliteRecordSetTest, AReadOnlyFileIsShownButNotChanged) {
  makeClips(3);
  std::filesystem::permissions(db, std::filesystem::perms::owner_read |
                                       std::filesystem::perms::group_read |
                                       std::filesystem::perms::others_read);
  SqliteRecordSet rs(db, "clips");
  EXPECT_TRUE(rs.isOpen());
  EXPECT_FALSE(rs.isWritable());
  EXPECT_TRUE(diag.contains("read-only"));
  EXPECT_STREQ(rs.text(2, 0), "clip2");
  EXPECT_FALSE(rs.storeText(2, 0, "changed"));
  EXPECT_FALSE(rs.swapRows(0, 1));
  EXPECT_STREQ(rs.text(2, 0), "clip2");
  std::filesystem::permissions(db, std::filesystem::perms::owner_all);
  EXPECT_EQ(query(db, "SELECT name FROM clips WHERE position = 2"), "clip2");
}

TEST_F(SqliteRecordSetTest, AGapInTheOrderIsFoundWhenItsPageIsRead) {
  makeClips(300);
  run(db, "DELETE FROM clips WHERE position = 200");
  SqliteRecordSet rs(db, "clips");
  EXPECT_TRUE(rs.readsByKey());
  EXPECT_EQ(rs.rowCount(), 300u);  // counted by its ends, not yet by its rows
  EXPECT_STREQ(rs.text(10, 0), "clip10");
  const unsigned long v = rs.version();
  EXPECT_STREQ(rs.text(200, 0), "clip201");  // the page with the gap
  EXPECT_FALSE(rs.readsByKey());
  EXPECT_EQ(rs.rowCount(), 299u);
  EXPECT_NE(rs.version(), v);
  EXPECT_STREQ(rs.text(298, 0), "clip299");
}
