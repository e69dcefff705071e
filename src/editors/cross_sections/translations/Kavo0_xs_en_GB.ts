<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
    <context>
        <name>CCrossSectionView</name>
        <message>
            <source>&amp;Points</source>
            <translation>&amp;Points</translation>
        </message>
        <message>
            <source>&amp;Points of %1</source>
            <translation>&amp;Points of %1</translation>
        </message>
        <message>
            <source>&amp;Cross sections</source>
            <translation>&amp;Cross sections</translation>
        </message>
        <message>
            <source>Cross sections by branch and chainage</source>
            <translation>Cross sections by branch and chainage</translation>
        </message>
        <message>
            <source>Points of the current cross section</source>
            <translation>Points of the current cross section</translation>
        </message>
        <message>
            <source>&amp;Insert Line</source>
            <translation>&amp;Insert Line</translation>
        </message>
        <message>
            <source>Adds a cross section or a point below the current one</source>
            <translation>Adds a cross section or a point below the current one</translation>
        </message>
        <message>
            <source>&amp;Delete Lines</source>
            <translation>&amp;Delete Lines</translation>
        </message>
        <message>
            <source>Deletes the selected cross sections or points</source>
            <translation>Deletes the selected cross sections or points</translation>
        </message>
        <message>
            <source>P&amp;revious Cross Section</source>
            <translation>P&amp;revious Cross Section</translation>
        </message>
        <message>
            <source>Shows the cross section above</source>
            <translation>Shows the cross section above</translation>
        </message>
        <message>
            <source>&amp;Next Cross Section</source>
            <translation>&amp;Next Cross Section</translation>
        </message>
        <message>
            <source>Shows the cross section below</source>
            <translation>Shows the cross section below</translation>
        </message>
        <message>
            <source>BRANCH</source>
            <translation>BRANCH</translation>
        </message>
    </context>
    <context>
        <name>CLinesTable</name>
        <message>
            <source>Line %1, %2: %3</source>
            <translation>Line %1, %2: %3</translation>
        </message>
    </context>
    <context>
        <name>CPointTable</name>
        <message>
            <source>Offset</source>
            <translation>Offset</translation>
        </message>
        <message>
            <source>Bed level</source>
            <translation>Bed level</translation>
        </message>
        <message>
            <source>%1 of Point</source>
            <translation>%1 of Point</translation>
        </message>
        <message>
            <source>Delete Points</source>
            <translation>Delete Points</translation>
        </message>
        <message>
            <source>Insert Point</source>
            <translation>Insert Point</translation>
        </message>
        <message>
            <source>Line %1 of the pasted text: expected an offset and a bed level, found "%2".</source>
            <translation>Line %1 of the pasted text: expected an offset and a bed level, found "%2".</translation>
        </message>
        <message>
            <source>The pasted text does not fit here: %1</source>
            <translation>The pasted text does not fit here: %1</translation>
        </message>
        <message>
            <source>Paste Points</source>
            <translation>Paste Points</translation>
        </message>
    </context>
    <context>
        <name>CSectionPlot</name>
        <message>
            <source>Offset</source>
            <translation>Offset</translation>
        </message>
        <message>
            <source>Bed level</source>
            <translation>Bed level</translation>
        </message>
        <message>
            <source>This cross section has no points yet. The Insert key in the table of points adds one.</source>
            <translation>This cross section has no points yet. The Insert key in the table of points adds one.</translation>
        </message>
        <message>
            <source>No cross section is selected.</source>
            <translation>No cross section is selected.</translation>
        </message>
        <message>
            <source>Topo ID %1</source>
            <translation>Topo ID %1</translation>
        </message>
        <message>
            <source>Radius %1</source>
            <translation>Radius %1</translation>
        </message>
        <message>
            <source>Plot of the cross section</source>
            <translation>Plot of the cross section</translation>
        </message>
        <message>
            <source>%1, points: %2</source>
            <translation>%1, points: %2</translation>
        </message>
        <message>
            <source>Offset %1
Bed level %2</source>
            <translation>Offset %1
Bed level %2</translation>
        </message>
        <message>
            <source>Width %1 (not within the profile)</source>
            <translation>Width %1 (not within the profile)</translation>
        </message>
        <message>
            <source>Width %1</source>
            <translation>Width %1</translation>
        </message>
    </context>
    <context>
        <name>CSectionTable</name>
        <message>
            <source>Branch</source>
            <translation>Branch</translation>
        </message>
        <message>
            <source>Chainage</source>
            <translation>Chainage</translation>
        </message>
        <message>
            <source>Radius</source>
            <translation>Radius</translation>
        </message>
        <message>
            <source>Width</source>
            <translation>Width</translation>
        </message>
        <message>
            <source>Topo ID</source>
            <translation>Topo ID</translation>
        </message>
        <message>
            <source>%1 of Cross Section</source>
            <translation>%1 of Cross Section</translation>
        </message>
        <message>
            <source>Delete Cross Sections</source>
            <translation>Delete Cross Sections</translation>
        </message>
        <message>
            <source>Insert Cross Section</source>
            <translation>Insert Cross Section</translation>
        </message>
    </context>
    <context>
        <name>CrossSectionTexts</name>
        <message>
            <source>Sections</source>
            <translation>Sections</translation>
        </message>
        <message>
            <source>KVR Cross Sections</source>
            <translation>KVR Cross Sections</translation>
        </message>
        <message>
            <source>KVR Cross Sections (*.kvxs)</source>
            <translation>KVR Cross Sections (*.kvxs)</translation>
        </message>
        <message>
            <source>Cross Sections</source>
            <translation>Cross Sections</translation>
        </message>
        <message>
            <source>KVR Cross Section Tools</source>
            <translation>KVR Cross Section Tools</translation>
        </message>
        <message>
            <source>Shows the cross section above
Previous Cross Section</source>
            <translation>Shows the cross section above
Previous Cross Section</translation>
        </message>
        <message>
            <source>Shows the cross section below
Next Cross Section</source>
            <translation>Shows the cross section below
Next Cross Section</translation>
        </message>
        <message>
            <source>Adds a cross section or a point below the current one
Insert Line</source>
            <translation>Adds a cross section or a point below the current one
Insert Line</translation>
        </message>
        <message>
            <source>Deletes the selected cross sections or points
Delete Lines</source>
            <translation>Deletes the selected cross sections or points
Delete Lines</translation>
        </message>
    </context>
    <context>
        <name>SectionRules</name>
        <message>
            <source>a cross section needs the name of its branch.</source>
            <translation>a cross section needs the name of its branch.</translation>
        </message>
        <message>
            <source>expected a width that is not negative.</source>
            <translation>expected a width that is not negative.</translation>
        </message>
        <message>
            <source>expected offsets that do not decrease from point to point.</source>
            <translation>expected offsets that do not decrease from point to point.</translation>
        </message>
        <message>
            <source>there is a cross section of branch "%1" at chainage %2 m with the topo ID "%3" already.</source>
            <translation>there is a cross section of branch "%1" at chainage %2 m with the topo ID "%3" already.</translation>
        </message>
    </context>
    <context>
        <name>CSectionLines</name>
        <message>
            <source>expected a number, found "%1".</source>
            <translation>expected a number, found "%1".</translation>
        </message>
    </context>
    <context>
        <name>CProjectDoc</name>
        <message>
            <source>%1 could not be saved.
%2</source>
            <translation>%1 could not be saved.
%2</translation>
        </message>
    </context>
</TS>
