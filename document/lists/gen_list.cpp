#include "document/lists/gen_list.h"

CGenList::CGenList() = default;
CGenList::~CGenList() = default;
