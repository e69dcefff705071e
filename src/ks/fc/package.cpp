#include "ks/fc/package.h"

CKsCBEItem::~CKsCBEItem() = default;
