// The names in river network files (.kvnw) that every reader of one needs.
#pragma once

namespace NetworkFile {
inline constexpr const char *Target = "KVR_NETWORK", *Branch = "Branch", *Name = "Name", *Chainage = "Chainage",
                            *FlowsDownstream = "FlowsDownstream";
}
