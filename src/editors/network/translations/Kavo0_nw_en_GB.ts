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
            <source>&amp;Layers:</source>
            <translation>&amp;Layers:</translation>
        </message>
        <message>
            <source>Layer</source>
            <translation>Layer</translation>
        </message>
        <message>
            <source>Geometry</source>
            <translation>Geometry</translation>
        </message>
        <message>
            <source>Lines</source>
            <translation>Lines</translation>
        </message>
        <message>
            <source>Coordinate system</source>
            <translation>Coordinate system</translation>
        </message>
        <message>
            <source>Remark</source>
            <translation>Remark</translation>
        </message>
        <message>
            <source>Layers of the file</source>
            <translation>Layers of the file</translation>
        </message>
        <message>
            <source>none named</source>
            <translation>none named</translation>
        </message>
        <message>
            <source>cannot be taken: no lines among %1 features</source>
            <translation>cannot be taken: no lines among %1 features</translation>
        </message>
        <message>
            <source>incomplete or damaged</source>
            <translation>incomplete or damaged</translation>
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
            <source>Lines whose &amp;parts do not meet:</source>
            <translation>Lines whose &amp;parts do not meet:</translation>
        </message>
        <message>
            <source>become branches NAME-1, NAME-2, each from 0 to its length</source>
            <translation>become branches NAME-1, NAME-2, each from 0 to its length</translation>
        </message>
        <message>
            <source>become branches that share the chainages of the line</source>
            <translation>become branches that share the chainages of the line</translation>
        </message>
        <message>
            <source>are left out</source>
            <translation>are left out</translation>
        </message>
        <message>
            <source>&amp;Coordinates in the network:</source>
            <translation>&amp;Coordinates in the network:</translation>
        </message>
        <message>
            <source>EPSG code of the coordinate system</source>
            <translation>EPSG code of the coordinate system</translation>
        </message>
        <message>
            <source>Take lines &amp;without a name, too</source>
            <translation>Take lines &amp;without a name, too</translation>
        </message>
        <message>
            <source>&amp;Take what could be read of the damaged file</source>
            <translation>&amp;Take what could be read of the damaged file</translation>
        </message>
        <message>
            <source>The branches of the network are in this coordinate s&amp;ystem, too</source>
            <translation>The branches of the network are in this coordinate s&amp;ystem, too</translation>
        </message>
        <message>
            <source>What the import &amp;gives:</source>
            <translation>What the import &amp;gives:</translation>
        </message>
        <message>
            <source>&amp;Import</source>
            <translation>&amp;Import</translation>
        </message>
        <message>
            <source>C&amp;opy</source>
            <translation>C&amp;opy</translation>
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
            <source>(none: by the length of the line)</source>
            <translation>(none: by the length of the line)</translation>
        </message>
        <message>
            <source>another one, by its EPSG code:</source>
            <translation>another one, by its EPSG code:</translation>
        </message>
        <message>
            <source>taken as the network&apos;s: %1</source>
            <translation>taken as the network&apos;s: %1</translation>
        </message>
        <message>
            <source>as in the file, taken as meters</source>
            <translation>as in the file, taken as meters</translation>
        </message>
        <message>
            <source>the network&apos;s: %1</source>
            <translation>the network&apos;s: %1</translation>
        </message>
        <message>
            <source>as in the file: %1</source>
            <translation>as in the file: %1</translation>
        </message>
        <message>
            <source>projected to %1</source>
            <translation>projected to %1</translation>
        </message>
        <message>
            <source>&quot;%1&quot; is no EPSG code of a coordinate system. Expected a number, for example 25832.</source>
            <translation>&quot;%1&quot; is no EPSG code of a coordinate system. Expected a number, for example 25832.</translation>
        </message>
        <message>
            <source>Choose a layer.</source>
            <translation>Choose a layer.</translation>
        </message>
        <message>
            <source>No line of this layer becomes a branch.</source>
            <translation>No line of this layer becomes a branch.</translation>
        </message>
        <message>
            <source>The network names the coordinate system &quot;%1&quot;, which is not known here.</source>
            <translation>The network names the coordinate system &quot;%1&quot;, which is not known here.</translation>
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
        <message>
            <source>%1 holds no lines. Its layers, with their geometry and the number of features:</source>
            <translation>%1 holds no lines. Its layers, with their geometry and the number of features:</translation>
        </message>
        <message>
            <source>Cha&amp;nnel of %1</source>
            <translation>&amp;Channel of %1</translation>
        </message>
        <message>
            <source>Cha&amp;nnel</source>
            <translation>&amp;Channel</translation>
        </message>
    </context>
    <context>
        <name>GisLines</name>
        <message>
            <source>%1 could not be read as a GIS file: %2</source>
            <translation>%1 could not be read as a GIS file: %2</translation>
        </message>
        <message>
            <source>the format is not known.</source>
            <translation>the format is not known.</translation>
        </message>
        <message>
            <source>%1 has no layers.</source>
            <translation>%1 has no layers.</translation>
        </message>
    </context>
    <context>
        <name>ImportBranches</name>
        <message>
            <source>feature %1</source>
            <translation>feature %1</translation>
        </message>
        <message>
            <source>&quot;%1&quot; (feature %2)</source>
            <translation>&quot;%1&quot; (feature %2)</translation>
        </message>
        <message>
            <source>could not be read: %1</source>
            <translation>could not be read: %1</translation>
        </message>
        <message>
            <source>has no geometry.</source>
            <translation>has no geometry.</translation>
        </message>
        <message>
            <source>is no line (%1).</source>
            <translation>is no line (%1).</translation>
        </message>
        <message>
            <source>has no name.</source>
            <translation>has no name.</translation>
        </message>
        <message>
            <source>vertices without coordinates, left out: %1.</source>
            <translation>vertices without coordinates, left out: %1.</translation>
        </message>
        <message>
            <source>lies outside the area of the coordinate system.</source>
            <translation>lies outside the area of the coordinate system.</translation>
        </message>
        <message>
            <source>the line has no length.</source>
            <translation>the line has no length.</translation>
        </message>
        <message>
            <source>the line is empty.</source>
            <translation>the line is empty.</translation>
        </message>
        <message>
            <source>parts outside the area of the coordinate system, left out: %1 of %2.</source>
            <translation>parts outside the area of the coordinate system, left out: %1 of %2.</translation>
        </message>
        <message>
            <source>parts without a length, left out: %1 of %2.</source>
            <translation>parts without a length, left out: %1 of %2.</translation>
        </message>
        <message>
            <source>its %1 parts meet and become one branch.</source>
            <translation>its %1 parts meet and become one branch.</translation>
        </message>
        <message>
            <source>Parts that ran the other way, turned: %1.</source>
            <translation>Parts that ran the other way, turned: %1.</translation>
        </message>
        <message>
            <source>Branch</source>
            <translation>Branch</translation>
        </message>
        <message>
            <source>has no name and becomes &quot;%1&quot;.</source>
            <translation>has no name and becomes &quot;%1&quot;.</translation>
        </message>
        <message>
            <source>this name is taken; the branch becomes &quot;%1&quot;.</source>
            <translation>this name is taken; the branch becomes &quot;%1&quot;.</translation>
        </message>
        <message>
            <source>no two different chainages; it goes from 0 to its length, %1.</source>
            <translation>no two different chainages; it goes from 0 to its length, %1.</translation>
        </message>
        <message>
            <source>its chainages go from %1 to %2, but the line is %3 long.</source>
            <translation>its chainages go from %1 to %2, but the line is %3 long.</translation>
        </message>
        <message>
            <source>its parts do not meet: %1 pieces.</source>
            <translation>its parts do not meet: %1 pieces.</translation>
        </message>
        <message>
            <source>The chainages of the line are shared out among them.</source>
            <translation>The chainages of the line are shared out among them.</translation>
        </message>
        <message>
            <source>Each goes from 0 to its length.</source>
            <translation>Each goes from 0 to its length.</translation>
        </message>
        <message>
            <source>its parts do not meet and become %1. %2</source>
            <translation>its parts do not meet and become %1. %2</translation>
        </message>
        <message>
            <source>The library that reads GIS files could not be loaded: %1</source>
            <translation>The library that reads GIS files could not be loaded: %1</translation>
        </message>
        <message>
            <source>&quot;%1&quot; (%2)</source>
            <translation>&quot;%1&quot; (%2)</translation>
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
        <name>CProjectDoc</name>
        <message>
            <source>%1 could not be saved.
%2</source>
            <translation>%1 could not be saved.
%2</translation>
        </message>
    </context>
    <context>
        <name>CImportReportDialog</name>
        <message>
            <source>Imported Branches</source>
            <translation>Imported Branches</translation>
        </message>
        <message>
            <source>C&amp;opy</source>
            <translation>C&amp;opy</translation>
        </message>
        <message>
            <source>&amp;Close</source>
            <translation>&amp;Close</translation>
        </message>
    </context>
    <context>
        <name>ImportReport</name>
        <message>
            <source>The layer names no coordinate system: its numbers are taken as meters on a map.</source>
            <translation>The layer names no coordinate system: its numbers are taken as meters on a map.</translation>
        </message>
        <message>
            <source>Coordinate system: %1, as in the file.</source>
            <translation>Coordinate system: %1, as in the file.</translation>
        </message>
        <message>
            <source>Coordinate system: %1, projected from %2.</source>
            <translation>Coordinate system: %1, projected from %2.</translation>
        </message>
        <message>
            <source>Lengths on this map are %1 times those on the ground</source>
            <translation>Lengths on this map are %1 times those on the ground</translation>
        </message>
        <message>
            <source> (from %1 to %2 by line)</source>
            <translation> (from %1 to %2 by line)</translation>
        </message>
        <message>
            <source>.</source>
            <translation>.</translation>
        </message>
        <message>
            <source>So are chainages that follow from them. Another coordinate system avoids this.</source>
            <translation>So are chainages that follow from them. Another coordinate system avoids this.</translation>
        </message>
        <message>
            <source>The file counts %1 features, but only %2 could be read.</source>
            <translation>The file counts %1 features, but only %2 could be read.</translation>
        </message>
        <message>
            <source>The file is incomplete or damaged.</source>
            <translation>The file is incomplete or damaged.</translation>
        </message>
        <message>
            <source>Features with errors: %1 of %2.</source>
            <translation>Features with errors: %1 of %2.</translation>
        </message>
        <message>
            <source>These lines lie %1 away from the branches of the network: they may be in different coordinate systems.</source>
            <translation>These lines lie %1 away from the branches of the network: they may be in different coordinate systems.</translation>
        </message>
        <message>
            <source>%1, layer &quot;%2&quot;</source>
            <translation>%1, layer &quot;%2&quot;</translation>
        </message>
        <message>
            <source>Branches: %1, in all %2</source>
            <translation>Branches: %1, in all %2</translation>
        </message>
        <message>
            <source>Left out</source>
            <translation>Left out</translation>
        </message>
        <message>
            <source>Changed</source>
            <translation>Changed</translation>
        </message>
        <message>
            <source>Branches</source>
            <translation>Branches</translation>
        </message>
        <message>
            <source>%1: %2 long, chainages from %3 to %4</source>
            <translation>%1: %2 long, chainages from %3 to %4</translation>
        </message>
        <message>
            <source>Report of the import</source>
            <translation>Report of the import</translation>
        </message>
    </context>
    <context>
        <name>GisGeometry</name>
        <message>
            <source>Point</source>
            <translation>Point</translation>
        </message>
        <message>
            <source>Multi Point</source>
            <translation>Multi Point</translation>
        </message>
        <message>
            <source>Line String</source>
            <translation>Line String</translation>
        </message>
        <message>
            <source>Multi Line String</source>
            <translation>Multi Line String</translation>
        </message>
        <message>
            <source>Polygon</source>
            <translation>Polygon</translation>
        </message>
        <message>
            <source>Multi Polygon</source>
            <translation>Multi Polygon</translation>
        </message>
        <message>
            <source>Unknown (any)</source>
            <translation>Unknown (any)</translation>
        </message>
        <message>
            <source>None</source>
            <translation>None</translation>
        </message>
        <message>
            <source>Compound Curve</source>
            <translation>Compound Curve</translation>
        </message>
        <message>
            <source>Multi Curve</source>
            <translation>Multi Curve</translation>
        </message>
        <message>
            <source>Geometry Collection</source>
            <translation>Geometry Collection</translation>
        </message>
    </context>
    <context>
        <name>GisSystems</name>
        <message>
            <source>%1 is in degrees: distances along a branch need a map in meters.</source>
            <translation>%1 is in degrees: distances along a branch need a map in meters.</translation>
        </message>
        <message>
            <source>%1 cannot be projected to %2. %3</source>
            <translation>%1 cannot be projected to %2. %3</translation>
        </message>
    </context>
</TS>
