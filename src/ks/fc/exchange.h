// What editors hand each other in the object list of a package. Chainages and lengths are in metres.
#pragma once

#include "ks/fc/package.h"

#include <cstdint>
#include <limits>
#include <vector>

class CView;

/// A value that the item does not carry. No number could say so: every one, NotGiven included, is a value that an HD
/// parameter file may hold and an item hands on. Files of networks and cross sections write it as nan.
inline constexpr double KsUnset = std::numeric_limits<double>::quiet_NaN();

/// A text, such as a branch name.
class KS_API CKvrCBEText : public CKsCBEItem
{
public:
    CString text;
};

/// A view of the project.
class KS_API CKvrCBEView : public CKsCBEItem
{
public:
    CView* view = nullptr; // for the duration of the call
};

/// A place on a branch, and the channel there as far as it is known.
class KS_API CKvrCBELocation : public CKsCBEItem
{
public:
    CString branch;
    double chainage = 0;
    double radius = KsUnset; // of curvature
    double width = KsUnset;  // of the water surface
};

/// A branch of the river network.
class KS_API CKvrCBEBranch : public CKsCBEItem
{
public:
    CString name;
    double start = 0, end = 0; // chainages of its ends, in whichever order the network has them
    bool downstream = true;    // water flows towards increasing chainage
};

/// The ground at a cross section; metres above datum, KsUnset for what is not known.
class KS_API CKvrCBEBedLevel : public CKsCBEItem
{
public:
    CString branch;
    double chainage = 0;
    double bed = KsUnset; // the deepest point
    // The highest points on either side of it, looking downstream.
    double leftBank = KsUnset, rightBank = KsUnset;
};

/// A location at which an HD parameter is given.
class KS_API CKvr_CBE_ModelDataItem : public CKsCBEItem
{
public:
    CString branch;
    double chainage = 0;
    double second = KsUnset; // the downstream chainage of a reach with a wave approximation
    int type = 0;            // HDDataType
    CString text;
    int flag = 0;

    // Items come by the hundred thousand, so they have a store of their own. As all of the exchange it belongs to the
    // user-interface thread.
    static void* operator new(std::size_t size);
    static void operator delete(void* item, std::size_t size);
};

/// The tables that exchange locations, by type code.
enum HDDataType
{
    HDInitialData,
    HDWindData,
    HDBedData,
    HDWaveData,
    HDWaterLossData,
    HDFloodData,
    HDMixingData,
    HDDataTypeCount
};

/// The user-defined marks. The first item of a list has their titles and, as `flags`, whether each is interpolated;
/// every further item has a location: the branch, and as `values` the chainage and then a level for each title (more
/// where the line holds more).
class KS_API CKvrCBEUserDefMark : public CKsCBEItem
{
public:
    std::vector<CString> titles;
    std::vector<std::int32_t> flags;
    std::vector<double> values; // 1e10 stands for a level that is not given
    CString branch;
};

/// The area of one map that the simulation is to write.
class KS_API CKvr_CBE_HDMaps : public CKsCBEItem
{
public:
    double xOrigin = 0, yOrigin = 0; // of the first cell, in map coordinates
    double rotation = 0;             // degrees
    double cellSize = 0;
    std::int32_t jCells = 0, kCells = 0;
    CString fileName;
};
