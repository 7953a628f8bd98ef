#include "foundation/ValAdaptorBase.h"

template class ValAdaptorBase<String>;
template class ValAdaptorBase<WString>;
template class ValAdaptorBase<ColourData>;
template class ValAdaptorBase<bool>;
template class ValAdaptorBase<int>;
template class ValAdaptorBase<unsigned int>;
template class ValAdaptorBase<float>;
template class ValAdaptorBase<double>;
template class ValAdaptorBase<ThumbSettings>;
