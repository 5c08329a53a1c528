#include "AlarmEditModel.h"

AlarmEditModel::~AlarmEditModel() = default;
