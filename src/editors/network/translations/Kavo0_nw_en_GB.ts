<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
    <context>
        <name>CBranchTable</name>
        <message>
            <source>Branch</source>
            <translation>Branch</translation>
        </message>
        <message>
            <source>From</source>
            <translation>From</translation>
        </message>
        <message>
            <source>To</source>
            <translation>To</translation>
        </message>
        <message>
            <source>Vertices</source>
            <translation>Vertices</translation>
        </message>
        <message>
            <source>Flow</source>
            <translation>Flow</translation>
        </message>
        <message>
            <source>Checked: water flows towards increasing chainages</source>
            <translation>Checked: water flows towards increasing chainages</translation>
        </message>
        <message>
            <source>increasing</source>
            <translation>increasing</translation>
        </message>
        <message>
            <source>decreasing</source>
            <translation>decreasing</translation>
        </message>
        <message>
            <source>Name of Branch</source>
            <translation>Name of Branch</translation>
        </message>
        <message>
            <source>expected a number, found &quot;%1&quot;.</source>
            <translation>expected a number, found &quot;%1&quot;.</translation>
        </message>
        <message>
            <source>Chainage of Branch</source>
            <translation>Chainage of Branch</translation>
        </message>
        <message>
            <source>Flow Direction</source>
            <translation>Flow Direction</translation>
        </message>
        <message>
            <source>Delete Branches</source>
            <translation>Delete Branches</translation>
        </message>
    </context>
    <context>
        <name>CChannelTable</name>
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
            <source>expected a number, found &quot;%1&quot;.</source>
            <translation>expected a number, found &quot;%1&quot;.</translation>
        </message>
        <message>
            <source>there is a line at this chainage already.</source>
            <translation>there is a line at this chainage already.</translation>
        </message>
        <message>
            <source>Channel</source>
            <translation>Channel</translation>
        </message>
        <message>
            <source>Delete Lines</source>
            <translation>Delete Lines</translation>
        </message>
        <message>
            <source>Insert Line</source>
            <translation>Insert Line</translation>
        </message>
    </context>
    <context>
        <name>CImportDialog</name>
        <message>
            <source>Import Branches from %1</source>
            <translation>Import Branches from %1</translation>
        </message>
        <message>
            <source>&amp;Layer:</source>
            <translation>&amp;Layer:</translation>
        </message>
        <message>
            <source>Field with the &amp;name:</source>
            <translation>Field with the &amp;name:</translation>
        </message>
        <message>
            <source>Field with the &amp;first chainage [m]:</source>
            <translation>Field with the &amp;first chainage [m]:</translation>
        </message>
        <message>
            <source>Field with the la&amp;st chainage [m]:</source>
            <translation>Field with the la&amp;st chainage [m]:</translation>
        </message>
        <message>
            <source>&amp;Import</source>
            <translation>&amp;Import</translation>
        </message>
        <message>
            <source>(none: numbered)</source>
            <translation>(none: numbered)</translation>
        </message>
        <message>
            <source>(none: 0)</source>
            <translation>(none: 0)</translation>
        </message>
        <message>
            <source>(none: length of the line)</source>
            <translation>(none: length of the line)</translation>
        </message>
        <message>
            <source>Lines: %1</source>
            <translation>Lines: %1</translation>
        </message>
        <message>
            <source>, the first is named &quot;%1&quot;</source>
            <translation>, the first is named &quot;%1&quot;</translation>
        </message>
        <message>
            <source>Left out, because they are no lines: %1</source>
            <translation>Left out, because they are no lines: %1</translation>
        </message>
    </context>
    <context>
        <name>CNetworkDoc</name>
        <message>
            <source>A branch needs a name.</source>
            <translation>A branch needs a name.</translation>
        </message>
        <message>
            <source>There is a branch &quot;%1&quot; already.</source>
            <translation>There is a branch &quot;%1&quot; already.</translation>
        </message>
        <message>
            <source>The chainages of the two ends of a branch have to differ.</source>
            <translation>The chainages of the two ends of a branch have to differ.</translation>
        </message>
    </context>
    <context>
        <name>CNetworkMap</name>
        <message>
            <source>Map of the river network</source>
            <translation>Map of the river network</translation>
        </message>
        <message>
            <source>This network has no branches yet.</source>
            <translation>This network has no branches yet.</translation>
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
        <name>CNetworkView</name>
        <message>
            <source>&amp;Channel of %1</source>
            <translation>&amp;Channel of %1</translation>
        </message>
        <message>
            <source>&amp;Channel</source>
            <translation>&amp;Channel</translation>
        </message>
        <message>
            <source>&amp;Branches</source>
            <translation>&amp;Branches</translation>
        </message>
        <message>
            <source>Branches of the river network</source>
            <translation>Branches of the river network</translation>
        </message>
        <message>
            <source>Radius and width along the current branch</source>
            <translation>Radius and width along the current branch</translation>
        </message>
        <message>
            <source>I&amp;mport Branches...</source>
            <translation>I&amp;mport Branches...</translation>
        </message>
        <message>
            <source>Reads lines of a GIS file as branches</source>
            <translation>Reads lines of a GIS file as branches</translation>
        </message>
        <message>
            <source>&amp;Insert Line</source>
            <translation>&amp;Insert Line</translation>
        </message>
        <message>
            <source>Adds a line to the channel of the branch</source>
            <translation>Adds a line to the channel of the branch</translation>
        </message>
        <message>
            <source>&amp;Delete Lines</source>
            <translation>&amp;Delete Lines</translation>
        </message>
        <message>
            <source>Deletes the selected lines of the table</source>
            <translation>Deletes the selected lines of the table</translation>
        </message>
        <message>
            <source>Show &amp;All</source>
            <translation>Show &amp;All</translation>
        </message>
        <message>
            <source>Shows the whole network on the map</source>
            <translation>Shows the whole network on the map</translation>
        </message>
        <message>
            <source>&amp;Zoom In</source>
            <translation>&amp;Zoom In</translation>
        </message>
        <message>
            <source>Enlarges the map</source>
            <translation>Enlarges the map</translation>
        </message>
        <message>
            <source>Zoom &amp;Out</source>
            <translation>Zoom &amp;Out</translation>
        </message>
        <message>
            <source>Makes the map smaller</source>
            <translation>Makes the map smaller</translation>
        </message>
        <message>
            <source>Import Branches</source>
            <translation>Import Branches</translation>
        </message>
        <message>
            <source>GIS files (%1)</source>
            <translation>GIS files (%1)</translation>
        </message>
        <message>
            <source>All files (*)</source>
            <translation>All files (*)</translation>
        </message>
        <message>
            <source>... and %1 more.</source>
            <translation>... and %1 more.</translation>
        </message>
        <message>
            <source>The branches were imported:</source>
            <translation>The branches were imported:</translation>
        </message>
        <message>
            <source>&amp;Show in HD Parameters</source>
            <translation>&amp;Show in HD Parameters</translation>
        </message>
        <message>
            <source>&amp;Delete Location</source>
            <translation>&amp;Delete Location</translation>
        </message>
        <message>
            <source>&amp;Insert Here as</source>
            <translation>&amp;Insert Here as</translation>
        </message>
    </context>
    <context>
        <name>GisLines</name>
        <message>
            <source>the format is not known.</source>
            <translation>the format is not known.</translation>
        </message>
        <message>
            <source>%1 could not be read as a GIS file: %2</source>
            <translation>%1 could not be read as a GIS file: %2</translation>
        </message>
        <message>
            <source>%1: the layer &quot;%2&quot; is in degrees of longitude and latitude. Distances along a branch need map coordinates in meters: project the file first.</source>
            <translation>%1: the layer &quot;%2&quot; is in degrees of longitude and latitude. Distances along a branch need map coordinates in metres: project the file first.</translation>
        </message>
        <message>
            <source>%1 holds no lines (%2 features of other kinds).</source>
            <translation>%1 holds no lines (%2 features of other kinds).</translation>
        </message>
    </context>
    <context>
        <name>ImportBranches</name>
        <message>
            <source>The library that reads GIS files could not be loaded: %1</source>
            <translation>The library that reads GIS files could not be loaded: %1</translation>
        </message>
        <message>
            <source>Branch</source>
            <translation>Branch</translation>
        </message>
        <message>
            <source>&quot;%1&quot; is taken and becomes &quot;%2&quot;.</source>
            <translation>&quot;%1&quot; is taken and becomes &quot;%2&quot;.</translation>
        </message>
        <message>
            <source>&quot;%1&quot;: no two different chainages; it goes from 0 to its length.</source>
            <translation>&quot;%1&quot;: no two different chainages; it goes from 0 to its length.</translation>
        </message>
    </context>
    <context>
        <name>LocationKinds</name>
        <message>
            <source>Initial</source>
            <translation>Initial</translation>
        </message>
        <message>
            <source>Wind</source>
            <translation>Wind</translation>
        </message>
        <message>
            <source>Bed resistance</source>
            <translation>Bed resistance</translation>
        </message>
        <message>
            <source>Wave</source>
            <translation>Wave</translation>
        </message>
        <message>
            <source>Water loss</source>
            <translation>Water loss</translation>
        </message>
        <message>
            <source>Flood plain</source>
            <translation>Flood plain</translation>
        </message>
        <message>
            <source>Mixing</source>
            <translation>Mixing</translation>
        </message>
    </context>
    <context>
        <name>MapOverlay</name>
        <message>
            <source>%1 not in this network</source>
            <translation>%1 not in this network</translation>
        </message>
    </context>
    <context>
        <name>NetworkFile</name>
        <message>
            <source>there is a branch &quot;%1&quot; already.</source>
            <translation>there is a branch &quot;%1&quot; already.</translation>
        </message>
        <message>
            <source>expected the branch's name, Name = &quot;...&quot;.</source>
            <translation>expected the branch's name, Name = &quot;...&quot;.</translation>
        </message>
        <message>
            <source>the chainages of the two ends have to differ.</source>
            <translation>the chainages of the two ends have to differ.</translation>
        </message>
        <message>
            <source>expected true or false.</source>
            <translation>expected true or false.</translation>
        </message>
        <message>
            <source>expected %1 numbers after &quot;%2 =&quot;.</source>
            <translation>expected %1 numbers after &quot;%2 =&quot;.</translation>
        </message>
        <message>
            <source>%1 is no river network: it has no section [%2].</source>
            <translation>%1 is no river network: it has no section [%2].</translation>
        </message>
    </context>
    <context>
        <name>NetworkTexts</name>
        <message>
            <source>Network</source>
            <translation>Network</translation>
        </message>
        <message>
            <source>KVR River Network</source>
            <translation>KVR River Network</translation>
        </message>
        <message>
            <source>KVR River Network (*.kvnw)</source>
            <translation>KVR River Network (*.kvnw)</translation>
        </message>
        <message>
            <source>River Network</source>
            <translation>River Network</translation>
        </message>
        <message>
            <source>KVR Network Tools</source>
            <translation>KVR Network Tools</translation>
        </message>
        <message>
            <source>Shows the whole network on the map
Show All</source>
            <translation>Shows the whole network on the map
Show All</translation>
        </message>
        <message>
            <source>Enlarges the map
Zoom In</source>
            <translation>Enlarges the map
Zoom In</translation>
        </message>
        <message>
            <source>Makes the map smaller
Zoom Out</source>
            <translation>Makes the map smaller
Zoom Out</translation>
        </message>
        <message>
            <source>Reads lines of a GIS file as branches
Import Branches</source>
            <translation>Reads lines of a GIS file as branches
Import Branches</translation>
        </message>
    </context>
    <context>
        <name>ParameterFile</name>
        <message>
            <source>%1, line %2: %3</source>
            <translation>%1, line %2: %3</translation>
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
