#include "gallery/ValuesPageModel.h"

#include <string>

// The level's adaptor, which also reports each request.
class ValuesPageModel::LevelAdaptor : public ValServerAdaptor<int> {
 public:
  LevelAdaptor(ValServer<int>* server, ValuesPageModel& model)
      : ValServerAdaptor<int>(server), model_(model) {}
  bool requestSetNewDataValue(const int& value, DataChangeType why) override {
    model_.noteRequest(value, why);
    return ValServerAdaptor<int>::requestSetNewDataValue(value, why);
  }

 private:
  ValuesPageModel& model_;
};

ValuesPageModel::ValuesPageModel(Canvas* page)
    : Glob(GlobCreationInfo(1, 1, page)), adaptor_(new LevelAdaptor(&level_, *this)) {
  unmap_canvas();
}

Kw::Ptr<ValAdaptorBase<int>> ValuesPageModel::levelAdaptor() const {
  return Kw::Ptr<ValAdaptorBase<int>>(adaptor_);
}

void ValuesPageModel::noteRequest(int value, DataChangeType why) {
  const String text = "level " + std::to_string(value) + " change " + std::to_string(int(why));
  if (Glob* page = parent()) send_msg(page, text.c_str());
}
