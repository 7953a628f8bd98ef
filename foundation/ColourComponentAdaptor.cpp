#include "foundation/ColourComponentAdaptor.h"

#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstdlib>

namespace {

String trimmed(const String& s) {
  const size_t b = s.find_first_not_of(" \t");
  if (b == String::npos) return String();
  const size_t e = s.find_last_not_of(" \t");
  return s.substr(b, e - b + 1);
}

}  // namespace

ColourComponentAdaptor::ColourComponentAdaptor(int component, ColourSpace space,
                                               ValServer<ColourData>* server)
    : component_(component), space_(ColourData::isValidSpace(space) ? space : ColourSpaceRGB) {
  if (server) registerWith(server);
}

String ColourComponentAdaptor::getDataValue() {
  const ValServer<ColourData>* server = getValServer(0);
  if (!server) return "---";
  ColourData c = server->getValue();
  c.setColourSpace(space_);
  const double v = component_ >= 0 && component_ <= 3 ? c.getComp(component_) : 0.0;
  char buf[64];
  if (ColourData::isDecimalSpace(space_)) {
    std::snprintf(buf, sizeof buf, "%.3lf", v);
  } else {
    std::snprintf(buf, sizeof buf, "%d", static_cast<int>(v * 255.0 + 0.5));
  }
  return buf;
}

bool ColourComponentAdaptor::parse(const String& text, double* value) const {
  if (component_ < 0 || component_ > 3) return false;
  const String t = trimmed(text);
  if (t.empty()) return false;
  double v = 0.0;
  char* end = nullptr;
  errno = 0;
  if (ColourData::isDecimalSpace(space_)) {
    v = std::strtod(t.c_str(), &end);
  } else {
    const long n = std::strtol(t.c_str(), &end, 10);
    if (n < 0 || n > 255) return false;
    v = n / 255.0;
  }
  if (errno != 0 || end != t.c_str() + t.size() || !std::isfinite(v)) return false;
  if (v < ColourData::compMin(space_, component_) || v > ColourData::compMax(space_, component_)) {
    return false;
  }
  *value = v;
  return true;
}

bool ColourComponentAdaptor::requestSetNewDataValue(const String& value, DataChangeType why) {
  ValServer<ColourData>* server = getValServer(0);
  double v = 0.0;
  ColourData c = server ? server->getValue() : ColourData();
  const ColourSpace held = c.getColourSpace();
  c.setColourSpace(space_);
  if (!server || !parse(value, &v) || !c.setComp(component_, v)) {
    // Put the model's text back into the controls in place of what was typed.
    forceWidgetUpdate();
    return false;
  }
  c.setColourSpace(held);
  server->setValue(c);
  return true;
}

void ColourComponentAdaptor::valChangedNtfy() {
  setNewWidgetValue(getDataValue());
}
