#pragma once
// The gallery's sample database of clips (name, duration, date, tags), made on first use in
// the user's data folder ($XDG_DATA_HOME/globkit, else ~/.local/share/globkit), and the
// record set and supplier that show it. An invisible Glob, so that the page owns it and it
// outlives the table made after it.
#include <memory>

#include "gallery/ClipSupplier.h"
#include "lists/SqliteRecordSet.h"
#include "platform/glob/Glob.h"

class ClipLibrary : public Glob {
 public:
  static constexpr int kSampleClips = 100000;

  explicit ClipLibrary(Canvas* parent);
  ~ClipLibrary() override;

  // The folder and file of the sample; "" when neither variable is set.
  static String dataFolder();
  // Writes `rows` clips into a new file at `path` in one transaction; false with a
  // diagnostic when the file cannot be made.
  static bool createSample(const String& path, int rows);

  ClipSupplier& supplier() { return *supplier_; }
  SqliteRecordSet& recordSet() { return *records_; }
  const char* idstring() const override { return "cliplibrary"; }

 private:
  std::unique_ptr<SqliteRecordSet> records_;
  std::unique_ptr<ClipSupplier> supplier_;
};
