#include <vexa/graph/graphdata.h>

GraphData::~GraphData() = default;
