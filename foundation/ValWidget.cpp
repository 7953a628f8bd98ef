#include "foundation/ValWidget.h"

template class ValWidget<String>;
template class ValWidget<WString>;
template class ValWidget<ColourData>;
template class ValWidget<bool>;
template class ValWidget<int>;
template class ValWidget<unsigned int>;
template class ValWidget<float>;
template class ValWidget<double>;
template class ValWidget<ThumbSettings>;
