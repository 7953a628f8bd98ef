// The library's default user-interface texts, in the string-table file form.
#include "platform/misc/ResourceStrings.h"

namespace {

constexpr const char* kLibraryStrings =
    "# Standard panels\n"
    "41\tOK\n"
    "# Size button help texts: panel at full size, panel minimised\n"
    "2713\tMinimise\n"
    "2714\tRestore\n";

}  // namespace

const ResourceStrings& libraryStrings() {
  static const ResourceStrings table = [] {
    ResourceStrings t;
    t.loadText(kLibraryStrings, "library strings");
    return t;
  }();
  return table;
}
