// The settings of an HD parameter file that are not tied to a location. Members carry their keywords' names; sections
// whose keywords would clash or mean little alone are nested structs. The initialisers are the defaults of a new file.
#pragma once

#include "data/families.h"
#include "files/declared_section.h"

#include <deque>

struct HDAddOutput
{
    std::int32_t ReducedOut = 0;
    bool Velo_H = false, Velo_struc = false, Discharge_H = false, CrossSec_H = false, FlowWidth_H = false;
    bool Radius_H = false, Resistance_H = false, Conveyance_H = false, FroudeNum_H = false;
    bool Volume_H = false, Volume_Total = false, FloodArea_H = false, FloodArea_Total = false;
    bool MassError_H = false, MassError_Total = false, AcumMassError_Total = false;
    bool Topo_print = false, Coef_print = false, Test_print = false, LatInflows_H = false;
    bool EnergyLevel = false, EnergySlope = false, WaterSlope = false, BedShearStress = false;
    bool GroundwaterHead = false, TimeStep = false;
};

struct HDMixingCoefficients
{
    std::vector<CMixingWCCoef> CoefPairs;
    double MixCoef1 = 0.17, MixCoef2 = 0.04, MixCoef3 = 0.1, MixCoef4 = 0.03;
};

struct HDBedResistTools
{
    std::int32_t Method = 0;
    bool Option1 = false, Option2 = false, Option3 = false;
    std::vector<CBRTVeloRes> VeloRes;
    double CoefA = 0, CoefB = 0, MinRes = 0, MaxRes = 0;
};

/// Water level increment due to curvature: what the system defines itself, and the global values of the rest.
struct HDCurveIncrement
{
    bool Enabled = false;
    bool SystemRange = false, SystemWidth = false, SystemRadius = false, SystemVelocity = false;
    std::int32_t Range = 0;
    double Width = 0, Radius = 0, Velocity = 0;
};

/// Water level increment due to sand bars.
struct HDSandBarIncrement
{
    bool Enabled = false;
    std::int32_t Method = 0; // 0 slope, width and area; 1 observed increment
    double Slope = 0, Width = 0, Area = 0, Observed = 0;
};

struct HDHeatBalance
{
    bool Calc = false;
    double Latitude = 55, Longitude = -12; // north and west positive
    double TimeZone = -15, DisTime = 0;
    double LightAtt = 10, betaBeer = 0;
    double RadA = 0.2, RadB = 0.5;
    double VapA = 1, VapB = 1;
};

struct HDStratification
{
    std::int32_t npv = 10; // number of layers
    bool dens = true;
    double visc = 0.003;
    std::int32_t vmf = 3, vmb = 0; // turbulence models in the fluid and at the bed
    bool Rich = true;
    double bpr1 = 1, bpr2 = 0;
    double uu = 1, uw = 1, uwc = 1;
    double dfx = 1, dfz = 1;
};

/// Constants of the two-layer model.
struct HDKlrConstants
{
    double fricfac = 0.002, maxvol = 100, maxvelo = 0.009, minthick = 0.01, densdiff = 0.001;
    std::int32_t action = 0;
    double R1 = 0.05, R2 = 0.05, Rs = 0.15;
};

/// Initial values of the two layers: 1 the top layer, 0 the bottom layer.
struct HDKlrInitial
{
    double h1 = 0, h0 = 0, Q1 = 0, Q0 = 0;
};

struct CTextOutItem
{
    std::int32_t Item = 0; // index of the quantity
    std::string UserName;
    std::int32_t Decimals = 2;
    ExtraParams Extra;

    static FieldList DeclaredFields();
};

struct CTextAutoFile
{
    std::string Format = "kvt Timeseries Bridge";
    bool AutoName = false;
    std::string FileName;
    ExtraParams Extra;

    static FieldList DeclaredFields();
};

struct HDTextOutput
{
    bool GenerateOutput = false;
    std::string Delimiter;
    std::int32_t ColumnWidth = 20;
    bool SummaryInfo[4] = {}; // minimum, maximum, time of minimum, time of maximum
    std::int32_t GridPointOutputType = 1;
    bool LimitedPeriod = false;
    HDDateTime LimitedPeriodStart = HDDateTime::Now(), LimitedPeriodEnd = HDDateTime::Now();
    std::vector<CTextOutItem> OutputItems;
    std::vector<CTextAutoFile> OutputFiles;
};

struct CMapsOutput
{
    double XOrigin = 0, YOrigin = 0, Rotation = 0, GridSize = 100;
    std::int32_t JCells = 100, KCells = 100;
    std::int32_t Reserved = 0; // kept with its row
    std::string FileName;
    std::int32_t Type = 0; // 0 maximum, 1 minimum, 2 dynamic
    std::int32_t StoringFrequency = 1;
    std::int32_t Item = 0;
    std::int32_t ComponentNo = 1;
    bool DefaultPeriod = false;
    HDDateTime StartTime = HDDateTime::Now(), EndTime = HDDateTime::Now();
    ExtraParams Extra;

    static FieldList DeclaredFields();
};

struct CMapsInput
{
    std::string FileName;
    std::int32_t ItemNo = 0;
    std::int32_t Order = 0; // priority among the files
    ExtraParams Extra;

    static FieldList DeclaredFields();
};

struct HDMapOutput
{
    bool GenerateOutput = false;
    bool ApplyDemInRiverXsec = false, ApplyDemGroundElevation = false;
    bool MapAreaGeoDb = false;
    std::string GeoDb;
    bool AddToCalculation = false;
    std::vector<CMapsOutput> MapOutputFiles;
    std::vector<CMapsInput> DemInputFiles;
};

struct HDLeakageGlobal
{
    bool IncludeLeakage = false;
    double LeakageCoefficient = 0;
};

class HD_Global_Var
{
public:
    // "Global_Values"
    double G_waterlevel = 0;
    std::int32_t iLevelDepth = 0; // initial values are 0 levels, 1 depths
    double G_discharge = 0;
    double G_wind_factor = 1;
    double G_resistance = 30;
    double G_S_max = 0, G_f = 0, G_k_100 = 1, G_min_width = 0;
    double G_flood_plan_res = -99;
    std::int32_t G_wave = 1; // as HD_Wavetype::WaveApproximation
    std::int32_t ResisZone = 0;
    double ZoneResistance1 = 30, ZoneResistance2 = 25, ZoneResistance3 = 20;

    // "Defalt_Values"
    double delta = 0.5, delhs = 0.01, delh = 0.1, alpha = 1, theta = 1, eps = 0.0001, dh_node = 0.01;
    double zeta_min = 0.1, struc_fac = 0, froude_exp = -1, froude_max = -1;
    std::int32_t no_iter = 1, max_iter = 100, inter1_max = 10;
    bool wind_shear_stress = false;
    std::int32_t resist_num = 0;
    double spilfc = 0, storfc = 0;

    // "Quasi_steady"
    double relax = 0.5, beta_limit = 1e-8, fac_0 = 2.5, qconv_factor = 0.001, hconv_factor = 0.01;
    double min_hconv = 1e-5, qstruc_factor = 0.005, hstop = 0.0001;
    bool EnergyEquation = false;
    std::int32_t FrictionSlope = 0; // default, average conveyance, average friction, geometric mean, harmonic mean
    bool ContractExpansion = false, SlopeUpstream = false, VelocityCoefficient = false;
    bool NoConvectiveSuppression = false;
    double G_Contraction = 0.1, G_Expansion = 0.3;

    HDAddOutput AddOutput;
    HDMixingCoefficients Mixing;
    std::vector<std::string> MarkTitles;
    std::deque<bool> MarkInterpolate; // one a title; a deque, because its elements have addresses
    HDBedResistTools BedResist;
    HDCurveIncrement CurveIncrement;
    HDSandBarIncrement SandBarIncrement;
    std::int32_t Max_no_iter = 20; // "Encroachment"
    HDHeatBalance HeatBalance;
    HDStratification Stratification;
    HDKlrConstants Klr;
    HDKlrInitial KlrInit;
    double G_friction_factor = 0.0024; // wind friction, stored in "KlrInit"
    HDTextOutput TextOutput;
    HDMapOutput MapOutput;
    HDLeakageGlobal Leakage;

    /// Reads section "Global_Variables" of the target. Sections, keywords and parameters that are missing keep their
    /// values.
    void Load(tqlHandle target, LoadReport* report = nullptr);
    /// Writes the section, every keyword of the table, then what the table does not know. There is one flag a mark
    /// title, whatever was read.
    void Save(tqlHandle structure) const;
    void ClearUnknown() { Kept = {}; }

    KeptContent Kept; // what the file says beyond that
};

/// The flags of user-defined marks, one a title.
inline constexpr std::string_view HDMarkSection = "WaterLevelMarkTitles", HDMarkFlags = "MarkInterpolate";

/// The section of a file that holds the global values: sub-sections and keywords in file order. Sub-sections of those
/// hold a list each, one keyword an element.
const DeclaredSection& HDGlobals();
