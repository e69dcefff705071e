<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
<context>
    <name>CHeatBalancePage</name>
    <message>
        <source>Vaporization</source>
        <translation>Vaporisation</translation>
    </message>
</context>
<context>
    <name>Kavo0_hd</name>
    <message>
        <source>Water level
Discharge
Velocity
Cross section area
Flow width
Radius
Resistance number
Conveyance
Froude number
Volume
Flooded area
Mass error
Lateral inflows
Water level slope
Energy level slope
Energy level
Bed shear stress
Lowest river bed level
Left levee bank level (marker 1)
Right levee bank level (marker 3)
Min. of left and right levee bank level
Left low flow bank level (marker 4)
Right low flow bank level (marker 5)
Min. of left and right low flow bank level
Center X-Y coordinates
Left X-Y coordinates
Right X-Y coordinates
User defined marks</source>
        <translation>Water level
Discharge
Velocity
Cross section area
Flow width
Radius
Resistance number
Conveyance
Froude number
Volume
Flooded area
Mass error
Lateral inflows
Water level slope
Energy level slope
Energy level
Bed shear stress
Lowest river bed level
Left levee bank level (marker 1)
Right levee bank level (marker 3)
Min. of left and right levee bank level
Left low flow bank level (marker 4)
Right low flow bank level (marker 5)
Min. of left and right low flow bank level
Centre X-Y coordinates
Left X-Y coordinates
Right X-Y coordinates
User defined marks</translation>
    </message>
</context>
</TS>
