#pragma once
/// How a class definition names the interface views of its instances: which
/// identifiers a view answers and how to make it.
#include "aaf/AAFTypes.h"

namespace aafmodel {

class ModelObject;
class ViewBase;

struct ViewMaker {
    bool (*answers)(const aafUID_t& iid);
    ViewBase* (*make)(ModelObject& object);
};

}  // namespace aafmodel
