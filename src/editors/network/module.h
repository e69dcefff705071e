// The plug-in KAVO0_NW: its document template and its tool bar.
#pragma once

#include "ks/fc/single_editor.h"

const KsSingleEditor& NetworkEditor();
