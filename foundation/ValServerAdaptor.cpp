#include "foundation/ValServerAdaptor.h"

template class ValServerAdaptor<String>;
template class ValServerAdaptor<WString>;
template class ValServerAdaptor<ColourData>;
template class ValServerAdaptor<bool>;
template class ValServerAdaptor<int>;
template class ValServerAdaptor<unsigned int>;
template class ValServerAdaptor<float>;
template class ValServerAdaptor<double>;
template class ValServerAdaptor<ThumbSettings>;
