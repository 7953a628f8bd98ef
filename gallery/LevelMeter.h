#pragma once
// A stand-in control for the foundation page: a row of segments showing an int from 0 to 10,
// bound to a model value. Clicking or dragging asks the model for a new level; the model's
// answer comes back through the adaptor to every meter bound to it.
#include "foundation/ValWidget.h"
#include "platform/glob/Glob.h"

class LevelMeter : public Glob, public ValWidget<int> {
 public:
  static constexpr int kLevels = 10;

  explicit LevelMeter(const GlobCreationInfo& info);

  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "levelmeter"; }
  String describeValue() const override { return std::to_string(level_); }

  int getWidgetValue() override { return level_; }
  void setNewWidgetValue(int& value) override;

 private:
  int levelAt(int x) const;

  int level_ = 0;
};
