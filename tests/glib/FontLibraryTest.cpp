// The library's own font configuration: which files its faces come from, application files,
// and faces it does not carry.
#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>

#include "platform/glib/FontCache.h"
#include "platform/glib/FontLibrary.h"
#include "platform/misc/Diagnostics.h"

namespace {

namespace fs = std::filesystem;
using Glib::FontDesc;

String libraryFile(const char* name) {
  return String(Glib::FontLibrary::kFontDir) + "/" + name;
}

TEST(GlibFontLibrary, FacesComeFromTheLibrarysOwnFiles) {
  const struct {
    const char* face;
    FontDesc::Style style;
    const char* file;
  } cases[] = {
      {"", FontDesc::Plain, "DejaVuSans.ttf"},
      {"", FontDesc::Bold, "DejaVuSans-Bold.ttf"},
      {"", FontDesc::Italic, "DejaVuSans-Oblique.ttf"},
      {"sans-serif", FontDesc::BoldItalic, "DejaVuSans-BoldOblique.ttf"},
      {"courier", FontDesc::Plain, "DejaVuSansMono.ttf"},
      {"Courier", FontDesc::Bold, "DejaVuSansMono-Bold.ttf"},
      {"Courier New", FontDesc::Italic, "DejaVuSansMono-Oblique.ttf"},
      {"monospace", FontDesc::BoldItalic, "DejaVuSansMono-BoldOblique.ttf"},
      {Glib::kMonospaceFontFace, FontDesc::Plain, "DejaVuSansMono.ttf"},
      {"serif", FontDesc::Plain, "DejaVuSerif.ttf"},
      {"dejavu serif", FontDesc::Italic, "DejaVuSerif-Italic.ttf"},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(Glib::fonts().get(FontDesc(c.face, 13, c.style))->fileName(), libraryFile(c.file))
        << '"' << c.face << "\" style " << c.style;
  }
  EXPECT_EQ(Glib::fonts().library().files().size(), Glib::FontLibrary::libraryFiles().size())
      << "every file the library names is installed";

  // The obfuscation face really is monospaced: wide and narrow letters take the same room.
  auto courier = Glib::fonts().get(FontDesc("courier", 13));
  EXPECT_EQ(courier->textWidth(L"iiii"), courier->textWidth(L"MMMM"));
  EXPECT_EQ(courier->desc().face, "courier") << "the font keeps the name it was asked by";
}

TEST(GlibFontLibrary, AFaceTheLibraryDoesNotCarryFallsBackWithOneDiagnostic) {
  Glib::FontCache cache;
  Diagnostics::Capture diag;
  const String face = "Globkit Test Face That Nobody Has";
  EXPECT_FALSE(cache.carries(face));
  auto plain = cache.get(FontDesc(face, 13));
  auto bold = cache.get(FontDesc(face, 20, FontDesc::Bold));
  cache.get(FontDesc(face, 13));
  ASSERT_EQ(diag.lines().size(), 1u);
  EXPECT_TRUE(diag.contains(face));
  // The system's fonts stand in: the text is measured and shaped, never left empty.
  EXPECT_GT(plain->textWidth(L"Gain"), 0);
  EXPECT_GT(bold->textWidth(L"Gain"), plain->textWidth(L"Gain"));
  EXPECT_GT(plain->height(), 0);

  // The library's own faces are never reported.
  diag.clear();
  cache.get(FontDesc("courier", 13));
  cache.get(FontDesc("serif", 13, FontDesc::Bold));
  EXPECT_TRUE(diag.lines().empty());
}

class GlibApplicationFonts : public ::testing::Test {
 protected:
  void SetUp() override {
    String pattern = ::testing::TempDir() + "globkit-fonts-XXXXXX";
    ASSERT_NE(mkdtemp(pattern.data()), nullptr);
    dir_ = pattern;
  }
  void TearDown() override {
    std::error_code ignored;
    fs::remove_all(dir_, ignored);
  }
  fs::path dir_;
};

TEST_F(GlibApplicationFonts, AnAddedFileProvidesItsFamilies) {
  // A DejaVu file the library does not load itself, under a folder of the application's own.
  const fs::path source = libraryFile("DejaVuSansCondensed.ttf");
  if (!fs::exists(source)) GTEST_SKIP() << source << " is not installed";
  const fs::path copy = dir_ / "AppCondensed.ttf";
  fs::copy_file(source, copy);
  const String family = "DejaVu Sans Condensed";

  Glib::FontCache cache;
  auto before = cache.standard();
  const int beforeWidth = before->textWidth(L"Settings");
  EXPECT_FALSE(cache.carries(family));
  {
    // Asked before the file is added: a stand-in, which must not outlive the addition.
    Diagnostics::Capture fallback;
    EXPECT_NE(cache.get(FontDesc(family, 13))->fileName(), copy.string());
  }

  Diagnostics::Capture diag;
  ASSERT_TRUE(cache.addFontFile(copy.string()));
  EXPECT_TRUE(cache.carries(family));
  auto condensed = cache.get(FontDesc(family, 13));
  EXPECT_EQ(condensed->fileName(), copy.string());
  EXPECT_LT(condensed->textWidth(L"Settings"), beforeWidth);
  EXPECT_TRUE(diag.lines().empty()) << diag.lines().front();
  EXPECT_EQ(cache.library().files().back(), copy.string());

  // The file also names itself "DejaVu Sans"; the standard face stays the library's own.
  auto after = cache.standard();
  EXPECT_EQ(after->fileName(), libraryFile("DejaVuSans.ttf"));
  EXPECT_EQ(after->textWidth(L"Settings"), beforeWidth);
  EXPECT_EQ(before->textWidth(L"Settings"), beforeWidth) << "fonts handed out stay usable";

  EXPECT_TRUE(cache.addFontFile(copy.string())) << "adding a file twice is harmless";
  EXPECT_EQ(cache.library().files().size(), Glib::FontLibrary::libraryFiles().size() + 1);
}

TEST_F(GlibApplicationFonts, FilesThatAreNoFontsAreRefused) {
  Glib::FontCache cache;
  const size_t loaded = cache.library().files().size();
  const fs::path text = dir_ / "notes.ttf";
  {
    FILE* f = fopen(text.c_str(), "w");
    ASSERT_NE(f, nullptr);
    fputs("not a font\n", f);
    fclose(f);
  }
  auto standard = cache.standard();
  const struct {
    String path;
    const char* why;
  } cases[] = {
      {(dir_ / "missing.ttf").string(), "is missing"},
      {dir_.string(), "is missing"},
      {text.string(), "holds no font"},
      {"", "is missing"},
  };
  for (const auto& c : cases) {
    Diagnostics::Capture diag;
    EXPECT_FALSE(cache.addFontFile(c.path)) << c.path;
    ASSERT_EQ(diag.lines().size(), 1u) << c.path;
    EXPECT_TRUE(diag.contains(c.why)) << diag.lines().front();
  }
  EXPECT_EQ(cache.library().files().size(), loaded);
  EXPECT_EQ(cache.standard().get(), standard.get()) << "a refused file changes nothing";
}

}  // namespace
