// A table over a supplier of 1,000 and of 1,000,000 rows: drawing one screen and scrolling it
// by a page cost the same at either size (target: at most 2 ms per screen). Opening the
// SQLite-backed table of 1,000,000 rows (target: at most 50 ms).
#include <benchmark/benchmark.h>
#include <sqlite3.h>
#include <unistd.h>

#include <filesystem>

#include "lists/DataTable.h"
#include "lists/OledbDataSupplier.h"
#include "lists/SqliteRecordSet.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"

namespace {

// Rows made up on request: nothing is stored, so only what the table asks for costs.
class GeneratedRows : public DataSupplier {
 public:
  explicit GeneratedRows(unsigned rows) : rows_(rows) {}
  Text getFieldText(const XY<int>& cell) override {
    return Text("Clip " + std::to_string(cell.y) + "/" + std::to_string(cell.x));
  }
  unsigned int getNumFields() const override { return 4; }
  unsigned int getSize() const override { return rows_; }
  unsigned long getDataVersion() const override { return 0; }
  const char* getFieldName(unsigned int c) override { return c == 0 ? "name" : "field"; }

 private:
  unsigned rows_;
};

void BM_TableScreenAndPage(benchmark::State& state) {
  Harness h(1000, 620);
  GeneratedRows rows(static_cast<unsigned>(state.range(0)));
  auto* table = new DataTable(h.place(0, 0, 1000, 620), &rows);
  table->setColumns({DataColumn(300), DataColumn(200), DataColumn(200), DataColumn(250)});
  table->setCurrentCell(XY<int>(0, static_cast<int>(state.range(0) / 2)));
  table->set_kbd_focus();
  h.render();
  bool pageDown = true;
  for (auto _ : state) {
    table->update();
    h.render();  // one screen
    // Down and back up again, so that both sizes show the same rows and only the number of
    // rows behind them differs.
    h.key(pageDown ? kKeyPageDown : kKeyPageUp);
    pageDown = !pageDown;
    h.render();  // scrolled by a page
  }
  state.SetItemsProcessed(state.iterations() * 2);  // screens
}
BENCHMARK(BM_TableScreenAndPage)->Arg(1000)->Arg(1000000)->Unit(benchmark::kMillisecond);

// The database is made once, outside the measurement.
String millionRowDatabase() {
  static const String path = [] {
    const String p = (std::filesystem::temp_directory_path() /
                      ("globkit-bench-" + std::to_string(getpid()) + ".db"))
                         .string();
    std::filesystem::remove(p);
    sqlite3* db = nullptr;
    sqlite3_open(p.c_str(), &db);
    sqlite3_exec(db,
                 "CREATE TABLE clips (name TEXT, duration REAL, date DATE, tags VARCHAR(32), "
                 "position INTEGER); CREATE UNIQUE INDEX clips_position ON clips(position); BEGIN;",
                 nullptr, nullptr, nullptr);
    sqlite3_stmt* st = nullptr;
    sqlite3_prepare_v2(db, "INSERT INTO clips VALUES (?1, ?2, '2024-05-01', 'music', ?3)", -1, &st,
                       nullptr);
    for (int i = 0; i < 1000000; ++i) {
      const String name = "Clip " + std::to_string(i);
      sqlite3_bind_text(st, 1, name.c_str(), -1, SQLITE_TRANSIENT);
      sqlite3_bind_double(st, 2, i * 0.5);
      sqlite3_bind_int(st, 3, i);
      sqlite3_step(st);
      sqlite3_reset(st);
    }
    sqlite3_finalize(st);
    sqlite3_exec(db, "COMMIT", nullptr, nullptr, nullptr);
    sqlite3_close(db);
    return p;
  }();
  return path;
}

void BM_OpenSqliteTableOfAMillionRows(benchmark::State& state) {
  const String path = millionRowDatabase();
  Harness h(1000, 620);
  for (auto _ : state) {
    SqliteRecordSet records(path, "clips");
    OledbDataSupplier supplier(records);
    auto* table = new DataTable(h.place(0, 0, 1000, 620), &supplier);
    table->setColumns({DataColumn(300), DataColumn(200), DataColumn(200), DataColumn(250)});
    h.render();  // the first screen
    delete table;
  }
}
BENCHMARK(BM_OpenSqliteTableOfAMillionRows)->Unit(benchmark::kMillisecond);

}  // namespace
