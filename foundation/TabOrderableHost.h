#pragma once
// A composite control that holds several tab stops and hands them out, in their tab order.
#include <vector>

class TabOrderable;

class TabOrderableHost {
 public:
  virtual ~TabOrderableHost() = default;
  virtual void getTabOrderables(std::vector<TabOrderable*>& out) = 0;
};
