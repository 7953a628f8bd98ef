#pragma once
// Shared pieces of the value-box tests: an adaptor that records what it was asked.
#include <gtest/gtest.h>

#include <functional>
#include <vector>

#include "foundation/ValAdaptorBase.h"
#include "values/ScrollBar.h"

// Accepts every value, keeps it as the model value, pushes it back to its controls, and
// records each request with its change type. `onRequest` runs after the push.
template <typename T>
class RecordingAdaptor : public ValAdaptorBase<T> {
 public:
  struct Request {
    T value;
    DataChangeType why;
  };

  T getDataValue() override { return model; }
  bool requestSetNewDataValue(const T& v, DataChangeType why) override {
    requests.push_back({v, why});
    model = v;
    this->setNewWidgetValue(v);
    if (onRequest) onRequest();
    return true;
  }

  std::vector<DataChangeType> changeTypes() const {
    std::vector<DataChangeType> out;
    for (const Request& r : requests) out.push_back(r.why);
    return out;
  }

  T model{};
  std::vector<Request> requests;
  std::function<void()> onRequest;
};

// A scroll bar made on `parent` at (x, y) with the requested size, its thumb `size` long at
// `pos`; a resizable thumb on request.
inline ScrollBar* makeScrollBar(Canvas* parent, int x, int y, unsigned short width,
                                unsigned short height, Orientation o, double pos, double size,
                                bool resizable = false) {
  ScrollBarInitArgs args(GlobCreationInfo(width, height, parent, x, y), o);
  args.resizableThumb = resizable;
  auto* b = new ScrollBar(args);
  b->setThumbSize(size);
  b->setThumbPos(pos);
  return b;
}
