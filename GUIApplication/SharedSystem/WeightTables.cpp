#include "SharedSystem/WeightTables.h"

#include "SharedSystem/WeightTables.inc"

std::atomic<const XYZ_WEIGHTS_T*> pILLOBS_TABLE{ILLOBS_WEIGHTS_TABLE5};
std::atomic<const XYZN_T*> pXYZN{XYZN_TABLE5};

void WeightTable_SelectColorTable(int table)
{
    if (table == COLOR_TABLE_6) {
        pILLOBS_TABLE = ILLOBS_WEIGHTS_TABLE6;
        pXYZN = XYZN_TABLE6;
    } else {
        pILLOBS_TABLE = ILLOBS_WEIGHTS_TABLE5;
        pXYZN = XYZN_TABLE5;
    }
}
