// Everything one HD parameter file holds: the global values, the lists in file order, and what the tables of
// this version do not know.
#pragma once

#include "data/families.h"
#include "data/gen_list.h"
#include "data/global_var.h"
#include "files/unknown_content.h"

inline constexpr const char* HDTargetName = "KAVO0_HD";

struct HD_Parameters
{
    HD_Global_Var Global;
    CGenParamList<HD_Initial> InitList{"InitList"};
    CGenParamList<HD_Windfact> WindList{"WindList"};
    CGenParamList<HD_Resistfact> BedList{"BedList"};
    CGenParamList<HD_Wavetype> WaveList{"WaveList"};
    CGenParamList<HD_Waterloss> WaterList{"WaterList"};
    CGenParamList<HD_Flood_resist> FloodList{"FloodList"};
    CGenParamList<HDMixingCoef> MixingCoefList{"MixingCoefList"};
    CGenParamList<HDWLMark> WaterLevelMarkList{"WaterLevelMarkList"};
    CGenParamList<HDBedResTool> BedResistanceToolboxList{"BedResistanceToolboxList"};
    CGenParamList<HDWLCurve> WLCurveList{"WLCurveList"};
    CGenParamList<HDWLSandBars> WLSandBarsList{"WLSandBarsList"};
    CGenMetaList<HDEncroach> EncroachList{"Enc_Simulation", "Encroachment_Setup"};
    CGenParamList<HDKlrParam> KlrParamList{"KlrParamList"};
    CGenParamList<HDKlrInit> KlrInitList{"KlrInitList"};
    CGenParamList<HDContraExpan> QSSContractionExpansionList{"QSSContractionExpansionList"};
    CGenParamList<HDReachLength> QSSReachLengthsList{"QSSReachLengthsList"};
    CGenParamList<HDOutputGridPoint> OutputGridPoints{"OutputGridPoints"};
    CGenParamList<HDLeakage> LeakageList{"LeakageList"};
    UnknownContent Unknown;

    /// Reads the target "KAVO0_HD" of a loaded structure; what is missing keeps its value. Lists are appended to, so
    /// a reader of a second file calls RemoveAllRecords first.
    void Load(tqlHandle structure, LoadReport* report = nullptr);
    /// Writes the target with everything in file order, then unknown targets. Encroachment sets without a filled line
    /// from the second on are left out unless `everySet`.
    void Save(tqlHandle structure, bool everySet = false) const;
    /// Empties all lists and the unknown content; the global values stay.
    void RemoveAllRecords();
    /// Removes blank records from the lists that are cleaned at save; false when `ask` refused.
    bool RemoveIncompleteLines(bool& asked, const std::function<bool()>& ask = {});
};

/// One row a list of the file, in file order.
struct ListEntry
{
    const char* section;
    bool purgedAtSave; // incomplete lines are removed when the document is saved
    CListSection& (*list)(HD_Parameters&);
    const CListSection& (*constList)(const HD_Parameters&);
};
std::span<const ListEntry> HDLists();
