<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
    <context>
        <name>CBedPage</name>
        <message>
            <source>Bed Resistance</source>
            <translation>Bed Resistance</translation>
        </message>
        <message>
            <source>Formula</source>
            <translation>Formula</translation>
        </message>
        <message>
            <source>Manning's M</source>
            <translation>Manning's M</translation>
        </message>
        <message>
            <source>Manning's n</source>
            <translation>Manning's n</translation>
        </message>
        <message>
            <source>Chezy</source>
            <translation>Chezy</translation>
        </message>
        <message>
            <source>Global Values</source>
            <translation>Global Values</translation>
        </message>
        <message>
            <source>&amp;Uniform section</source>
            <translation>&amp;Uniform section</translation>
        </message>
        <message>
            <source>&amp;Resistance:</source>
            <translation>&amp;Resistance:</translation>
        </message>
        <message>
            <source>&amp;Three zones</source>
            <translation>&amp;Three zones</translation>
        </message>
        <message>
            <source>Zone &amp;1 (main channel):</source>
            <translation>Zone &amp;1 (main channel):</translation>
        </message>
        <message>
            <source>Zone &amp;2 (transition):</source>
            <translation>Zone &amp;2 (transition):</translation>
        </message>
        <message>
            <source>Zone &amp;3 (flood plain):</source>
            <translation>Zone &amp;3 (flood plain):</translation>
        </message>
        <message>
            <source>Local Values</source>
            <translation>Local Values</translation>
        </message>
        <message>
            <source>Re&amp;sistance formula:</source>
            <translation>Re&amp;sistance formula:</translation>
        </message>
    </context>
    <context>
        <name>CBedToolboxPage</name>
        <message>
            <source>Bed Resistance Toolbox</source>
            <translation>Bed Resistance Toolbox</translation>
        </message>
        <message>
            <source>Global Values</source>
            <translation>Global Values</translation>
        </message>
        <message>
            <source>&amp;Method:</source>
            <translation>&amp;Method:</translation>
        </message>
        <message>
            <source>Not used</source>
            <translation>Not used</translation>
        </message>
        <message>
            <source>Coefficients a and b</source>
            <translation>Coefficients a and b</translation>
        </message>
        <message>
            <source>Table over velocity</source>
            <translation>Table over velocity</translation>
        </message>
        <message>
            <source>Apply in:</source>
            <translation>Apply in:</translation>
        </message>
        <message>
            <source>Zone &amp;1</source>
            <translation>Zone &amp;1</translation>
        </message>
        <message>
            <source>Zone &amp;2</source>
            <translation>Zone &amp;2</translation>
        </message>
        <message>
            <source>Zone &amp;3</source>
            <translation>Zone &amp;3</translation>
        </message>
        <message>
            <source>Coefficient &amp;a:</source>
            <translation>Coefficient &amp;a:</translation>
        </message>
        <message>
            <source>Coefficient &amp;b:</source>
            <translation>Coefficient &amp;b:</translation>
        </message>
        <message>
            <source>Mi&amp;nimum resistance:</source>
            <translation>Mi&amp;nimum resistance:</translation>
        </message>
        <message>
            <source>Ma&amp;ximum resistance:</source>
            <translation>Ma&amp;ximum resistance:</translation>
        </message>
        <message>
            <source>Local Values</source>
            <translation>Local Values</translation>
        </message>
        <message>
            <source>Velocity table</source>
            <translation>Velocity table</translation>
        </message>
        <message>
            <source>Velocity table of the current line</source>
            <translation>Velocity table of the current line</translation>
        </message>
    </context>
    <context>
        <name>CDefaultPage</name>
        <message>
            <source>Computation Scheme</source>
            <translation>Computation Scheme</translation>
        </message>
        <message>
            <source>Del&amp;ta:</source>
            <translation>Del&amp;ta:</translation>
        </message>
        <message>
            <source>Delh&amp;s:</source>
            <translation>Delh&amp;s:</translation>
        </message>
        <message>
            <source>&amp;Delh:</source>
            <translation>&amp;Delh:</translation>
        </message>
        <message>
            <source>&amp;Alpha:</source>
            <translation>&amp;Alpha:</translation>
        </message>
        <message>
            <source>E&amp;ps:</source>
            <translation>E&amp;ps:</translation>
        </message>
        <message>
            <source>Dh N&amp;ode:</source>
            <translation>Dh N&amp;ode:</translation>
        </message>
        <message>
            <source>&amp;Zeta Min:</source>
            <translation>&amp;Zeta Min:</translation>
        </message>
        <message>
            <source>St&amp;ruc Fac:</source>
            <translation>St&amp;ruc Fac:</translation>
        </message>
        <message>
            <source>&amp;Inter1Max:</source>
            <translation>&amp;Inter1Max:</translation>
        </message>
        <message>
            <source>&amp;NoIter:</source>
            <translation>&amp;NoIter:</translation>
        </message>
        <message>
            <source>&amp;MaxIterSteady:</source>
            <translation>&amp;MaxIterSteady:</translation>
        </message>
        <message>
            <source>Fro&amp;udeMax:</source>
            <translation>Fro&amp;udeMax:</translation>
        </message>
        <message>
            <source>FroudeE&amp;xp:</source>
            <translation>FroudeE&amp;xp:</translation>
        </message>
        <message>
            <source>Switches</source>
            <translation>Switches</translation>
        </message>
        <message>
            <source>Node &amp;Compatibility</source>
            <translation>Node &amp;Compatibility</translation>
        </message>
        <message>
            <source>Water Level</source>
            <translation>Water Level</translation>
        </message>
        <message>
            <source>(Energy - Not Avail.)</source>
            <translation>(Energy - Not Avail.)</translation>
        </message>
        <message>
            <source>Theta:</source>
            <translation>Theta:</translation>
        </message>
    </context>
    <context>
        <name>CEditorsLoadOptionDlg</name>
        <message>
            <source>Load Branch and Chainage</source>
            <translation>Load Branch and Chainage</translation>
        </message>
        <message>
            <source>&amp;Branch and Chainage,</source>
            <translation>&amp;Branch and Chainage,</translation>
        </message>
        <message>
            <source>from Cross Section Editor</source>
            <translation>from Cross Section Editor</translation>
        </message>
        <message>
            <source>Branch, Chainage and &amp;Radius,</source>
            <translation>Branch, Chainage and &amp;Radius,</translation>
        </message>
        <message>
            <source>from Cross Section Editor and Network Editor</source>
            <translation>from Cross Section Editor and Network Editor</translation>
        </message>
        <message>
            <source>Branch, Chainage, Radius and Channel &amp;Width,</source>
            <translation>Branch, Chainage, Radius and Channel &amp;Width,</translation>
        </message>
    </context>
    <context>
        <name>CEncroachPage</name>
        <message>
            <source>Iteration</source>
            <translation>Iteration</translation>
        </message>
        <message>
            <source>&amp;Maximum number of iterations:</source>
            <translation>&amp;Maximum number of iterations:</translation>
        </message>
        <message>
            <source>Encroachment set-ups</source>
            <translation>Encroachment set-ups</translation>
        </message>
        <message>
            <source>Set-&amp;up:</source>
            <translation>Set-&amp;up:</translation>
        </message>
        <message>
            <source>&amp;Previous</source>
            <translation>&amp;Previous</translation>
        </message>
        <message>
            <source>Ne&amp;xt</source>
            <translation>Ne&amp;xt</translation>
        </message>
        <message>
            <source>&amp;Add</source>
            <translation>&amp;Add</translation>
        </message>
        <message>
            <source>Lines of the set-up</source>
            <translation>Lines of the set-up</translation>
        </message>
        <message>
            <source>&amp;Duplicate</source>
            <translation>&amp;Duplicate</translation>
        </message>
        <message>
            <source>Dele&amp;te</source>
            <translation>Dele&amp;te</translation>
        </message>
    </context>
    <context>
        <name>CFloodPage</name>
        <message>
            <source>Flood Plain Resistance</source>
            <translation>Flood Plain Resistance</translation>
        </message>
        <message>
            <source>Global Value</source>
            <translation>Global Value</translation>
        </message>
        <message>
            <source>Flood Plain &amp;Resistance:</source>
            <translation>Flood Plain &amp;Resistance:</translation>
        </message>
        <message>
            <source>Local Values</source>
            <translation>Local Values</translation>
        </message>
    </context>
    <context>
        <name>CGotoDlg</name>
        <message>
            <source>Go to grid line</source>
            <translation>Go to grid line</translation>
        </message>
        <message>
            <source>&amp;Line number:</source>
            <translation>&amp;Line number:</translation>
        </message>
    </context>
    <context>
        <name>CHeatBalancePage</name>
        <message>
            <source>Heat Balance Calculation</source>
            <translation>Heat Balance Calculation</translation>
        </message>
        <message>
            <source>&amp;Included</source>
            <translation>&amp;Included</translation>
        </message>
        <message>
            <source>Location</source>
            <translation>Location</translation>
        </message>
        <message>
            <source>L&amp;atitude (N pos.)</source>
            <translation>L&amp;atitude (N pos.)</translation>
        </message>
        <message>
            <source>L&amp;ongitude (W pos.)</source>
            <translation>L&amp;ongitude (W pos.)</translation>
        </message>
        <message>
            <source>&amp;Time meridian zone (W pos.)</source>
            <translation>&amp;Time meridian zone (W pos.)</translation>
        </message>
        <message>
            <source>&amp;Displacement in time</source>
            <translation>&amp;Displacement in time</translation>
        </message>
        <message>
            <source>Solar absorption</source>
            <translation>Solar absorption</translation>
        </message>
        <message>
            <source>Li&amp;ght attenuation</source>
            <translation>Li&amp;ght attenuation</translation>
        </message>
        <message>
            <source>&amp;Constant in Beer's law</source>
            <translation>&amp;Constant in Beer's law</translation>
        </message>
        <message>
            <source>Radiation under cloudy skies</source>
            <translation>Radiation under cloudy skies</translation>
        </message>
        <message>
            <source>&amp;Parameter A</source>
            <translation>&amp;Parameter A</translation>
        </message>
        <message>
            <source>Parameter &amp;B</source>
            <translation>Parameter &amp;B</translation>
        </message>
        <message>
            <source>Vaporization</source>
            <translation>Vaporization</translation>
        </message>
        <message>
            <source>Pa&amp;rameter A</source>
            <translation>Pa&amp;rameter A</translation>
        </message>
        <message>
            <source>Para&amp;meter B</source>
            <translation>Para&amp;meter B</translation>
        </message>
    </context>
    <context>
        <name>CInitPage</name>
        <message>
            <source>Initial conditions</source>
            <translation>Initial conditions</translation>
        </message>
        <message>
            <source>Global Values</source>
            <translation>Global Values</translation>
        </message>
        <message>
            <source>Water &amp;Depth</source>
            <translation>Water &amp;Depth</translation>
        </message>
        <message>
            <source>Local Values</source>
            <translation>Local Values</translation>
        </message>
        <message>
            <source>Wa&amp;ter Level</source>
            <translation>Wa&amp;ter Level</translation>
        </message>
        <message>
            <source>Wate&amp;r Level</source>
            <translation>Wate&amp;r Level</translation>
        </message>
        <message>
            <source>Water De&amp;pth</source>
            <translation>Water De&amp;pth</translation>
        </message>
        <message>
            <source>Di&amp;scharge:</source>
            <translation>Di&amp;scharge:</translation>
        </message>
    </context>
    <context>
        <name>CKlrInitPage</name>
        <message>
            <source>Initial conditions</source>
            <translation>Initial conditions</translation>
        </message>
        <message>
            <source>Global values</source>
            <translation>Global values</translation>
        </message>
        <message>
            <source>&amp;Interface level (h0)</source>
            <translation>&amp;Interface level (h0)</translation>
        </message>
        <message>
            <source>Discharge &amp;toplayer (Q1)</source>
            <translation>Discharge &amp;toplayer (Q1)</translation>
        </message>
        <message>
            <source>Discharge &amp;bottom layer (Q0)</source>
            <translation>Discharge &amp;bottom layer (Q0)</translation>
        </message>
        <message>
            <source>Local values</source>
            <translation>Local values</translation>
        </message>
        <message>
            <source>Wate&amp;r level (h1)</source>
            <translation>Wate&amp;r level (h1)</translation>
        </message>
    </context>
    <context>
        <name>CKlrParamPage</name>
        <message>
            <source>Model Constants</source>
            <translation>Model Constants</translation>
        </message>
        <message>
            <source>&amp;Interface Friction Factor</source>
            <translation>&amp;Interface Friction Factor</translation>
        </message>
        <message>
            <source>Minimum layer &amp;thickness for entrainment cutoff</source>
            <translation>Minimum layer &amp;thickness for entrainment cutoff</translation>
        </message>
        <message>
            <source>Minimum relative &amp;density difference</source>
            <translation>Minimum relative &amp;density difference</translation>
        </message>
        <message>
            <source>&amp;Action for disappearing interface</source>
            <translation>&amp;Action for disappearing interface</translation>
        </message>
        <message>
            <source>Nothing</source>
            <translation>Nothing</translation>
        </message>
        <message>
            <source>Moving interface up</source>
            <translation>Moving interface up</translation>
        </message>
        <message>
            <source>Moving interface down</source>
            <translation>Moving interface down</translation>
        </message>
        <message>
            <source>Richardsens Bulk Flux No.</source>
            <translation>Richardsens Bulk Flux No.</translation>
        </message>
        <message>
            <source>Global values</source>
            <translation>Global values</translation>
        </message>
        <message>
            <source>R1 &amp;upward entrainment</source>
            <translation>R1 &amp;upward entrainment</translation>
        </message>
        <message>
            <source>R1 d&amp;ownward entrainment</source>
            <translation>R1 d&amp;ownward entrainment</translation>
        </message>
        <message>
            <source>&amp;Rs upward entrainment at controls</source>
            <translation>&amp;Rs upward entrainment at controls</translation>
        </message>
        <message>
            <source>Local values</source>
            <translation>Local values</translation>
        </message>
        <message>
            <source>&amp;Maximum volume of entrainment</source>
            <translation>&amp;Maximum volume of entrainment</translation>
        </message>
        <message>
            <source>Ma&amp;ximum entrainment velocity</source>
            <translation>Ma&amp;ximum entrainment velocity</translation>
        </message>
    </context>
    <context>
        <name>CKsEditStyle</name>
        <message>
            <source>Unit: %1</source>
            <translation>Unit: %1</translation>
        </message>
    </context>
    <context>
        <name>CLeakagePage</name>
        <message>
            <source>&amp;Include Leakage</source>
            <translation>&amp;Include Leakage</translation>
        </message>
        <message>
            <source>Global Leakage Coefficient</source>
            <translation>Global Leakage Coefficient</translation>
        </message>
        <message>
            <source>&amp;Coefficient:</source>
            <translation>&amp;Coefficient:</translation>
        </message>
        <message>
            <source>Local Leakage Coefficients</source>
            <translation>Local Leakage Coefficients</translation>
        </message>
    </context>
    <context>
        <name>CLossPage</name>
        <message>
            <source>Water Loss</source>
            <translation>Water Loss</translation>
        </message>
    </context>
    <context>
        <name>CMapsPage</name>
        <message>
            <source>&amp;Generate maps</source>
            <translation>&amp;Generate maps</translation>
        </message>
        <message>
            <source>Output</source>
            <translation>Output</translation>
        </message>
        <message>
            <source>Map output files</source>
            <translation>Map output files</translation>
        </message>
        <message>
            <source>Input topography</source>
            <translation>Input topography</translation>
        </message>
        <message>
            <source>Apply DEM data between river &amp;cross-sections</source>
            <translation>Apply DEM data between river &amp;cross-sections</translation>
        </message>
        <message>
            <source>DEM input files</source>
            <translation>DEM input files</translation>
        </message>
        <message>
            <source>&amp;Map additional flooded areas using help grid from KVR GIS</source>
            <translation>&amp;Map additional flooded areas using help grid from KVR GIS</translation>
        </message>
        <message>
            <source>&amp;Apply DEM input data for ground elevations</source>
            <translation>&amp;Apply DEM input data for ground elevations</translation>
        </message>
        <message>
            <source>Hel&amp;p grid</source>
            <translation>Hel&amp;p grid</translation>
        </message>
    </context>
    <context>
        <name>CMixingCoefPage</name>
        <message>
            <source>Mixing Coefficients</source>
            <translation>Mixing Coefficients</translation>
        </message>
        <message>
            <source>Global Values</source>
            <translation>Global Values</translation>
        </message>
        <message>
            <source>Mixing coefficient f&amp;1:</source>
            <translation>Mixing coefficient f&amp;1:</translation>
        </message>
        <message>
            <source>Mixing coefficient f&amp;2:</source>
            <translation>Mixing coefficient f&amp;2:</translation>
        </message>
        <message>
            <source>Mixing coefficient f&amp;3:</source>
            <translation>Mixing coefficient f&amp;3:</translation>
        </message>
        <message>
            <source>Mixing coefficient f&amp;4:</source>
            <translation>Mixing coefficient f&amp;4:</translation>
        </message>
        <message>
            <source>Local Values</source>
            <translation>Local Values</translation>
        </message>
        <message>
            <source>Table over the width-depth ratio</source>
            <translation>Table over the width-depth ratio</translation>
        </message>
        <message>
            <source>Table of the current line</source>
            <translation>Table of the current line</translation>
        </message>
    </context>
    <context>
        <name>COutputPage</name>
        <message>
            <source>H or Q points</source>
            <translation>H or Q points</translation>
        </message>
        <message>
            <source>H and Q points</source>
            <translation>H and Q points</translation>
        </message>
        <message>
            <source>Total</source>
            <translation>Total</translation>
        </message>
        <message>
            <source>Structures</source>
            <translation>Structures</translation>
        </message>
        <message>
            <source>Velocity</source>
            <translation>Velocity</translation>
        </message>
        <message>
            <source>Discharge</source>
            <translation>Discharge</translation>
        </message>
        <message>
            <source>Cross Section Area</source>
            <translation>Cross Section Area</translation>
        </message>
        <message>
            <source>Flow Width</source>
            <translation>Flow Width</translation>
        </message>
        <message>
            <source>Radius</source>
            <translation>Radius</translation>
        </message>
        <message>
            <source>Resistance</source>
            <translation>Resistance</translation>
        </message>
        <message>
            <source>Conveyance</source>
            <translation>Conveyance</translation>
        </message>
        <message>
            <source>Froude Number</source>
            <translation>Froude Number</translation>
        </message>
        <message>
            <source>Volume</source>
            <translation>Volume</translation>
        </message>
        <message>
            <source>Flood Area</source>
            <translation>Flood Area</translation>
        </message>
        <message>
            <source>Mass Error</source>
            <translation>Mass Error</translation>
        </message>
        <message>
            <source>Accumulated Mass Error</source>
            <translation>Accumulated Mass Error</translation>
        </message>
        <message>
            <source>Lateral Inflows</source>
            <translation>Lateral Inflows</translation>
        </message>
        <message>
            <source>Water level slope</source>
            <translation>Water level slope</translation>
        </message>
        <message>
            <source>Energy level slope</source>
            <translation>Energy level slope</translation>
        </message>
        <message>
            <source>Energy level</source>
            <translation>Energy level</translation>
        </message>
        <message>
            <source>Bed shear stress</source>
            <translation>Bed shear stress</translation>
        </message>
        <message>
            <source>Groundwater head</source>
            <translation>Groundwater head</translation>
        </message>
        <message>
            <source>Time Step</source>
            <translation>Time Step</translation>
        </message>
    </context>
    <context>
        <name>CQuasiPage</name>
        <message>
            <source>Computational parameters</source>
            <translation>Computational parameters</translation>
        </message>
        <message>
            <source>&amp;Relax:</source>
            <translation>&amp;Relax:</translation>
        </message>
        <message>
            <source>&amp;Beta_Limit:</source>
            <translation>&amp;Beta_Limit:</translation>
        </message>
        <message>
            <source>&amp;Qconv_Factor:</source>
            <translation>&amp;Qconv_Factor:</translation>
        </message>
        <message>
            <source>&amp;Min_Hconv_In_Branch:</source>
            <translation>&amp;Min_Hconv_In_Branch:</translation>
        </message>
        <message>
            <source>Q_&amp;struc_Factor:</source>
            <translation>Q_&amp;struc_Factor:</translation>
        </message>
        <message>
            <source>Hs&amp;top:</source>
            <translation>Hs&amp;top:</translation>
        </message>
        <message>
            <source>Steady State Options</source>
            <translation>Steady State Options</translation>
        </message>
        <message>
            <source>&amp;Use energy equation</source>
            <translation>&amp;Use energy equation</translation>
        </message>
        <message>
            <source>&amp;Allow upstream slope</source>
            <translation>&amp;Allow upstream slope</translation>
        </message>
        <message>
            <source>&amp;No suppression of convective terms</source>
            <translation>&amp;No suppression of convective terms</translation>
        </message>
        <message>
            <source>Default</source>
            <translation>Default</translation>
        </message>
        <message>
            <source>Average conveyance</source>
            <translation>Average conveyance</translation>
        </message>
        <message>
            <source>Average friction</source>
            <translation>Average friction</translation>
        </message>
        <message>
            <source>Geometric mean</source>
            <translation>Geometric mean</translation>
        </message>
        <message>
            <source>Harmonic mean</source>
            <translation>Harmonic mean</translation>
        </message>
        <message>
            <source>Contraction expansion coefficients</source>
            <translation>Contraction expansion coefficients</translation>
        </message>
        <message>
            <source>&amp;Contraction</source>
            <translation>&amp;Contraction</translation>
        </message>
        <message>
            <source>E&amp;xpansion</source>
            <translation>E&amp;xpansion</translation>
        </message>
        <message>
            <source>Load branch an&amp;d chainages</source>
            <translation>Load branch an&amp;d chainages</translation>
        </message>
        <message>
            <source>Fac_&amp;0:</source>
            <translation>Fac_&amp;0:</translation>
        </message>
        <message>
            <source>Hc&amp;onv_Factor:</source>
            <translation>Hc&amp;onv_Factor:</translation>
        </message>
        <message>
            <source>Model contraction and ex&amp;pansion losses</source>
            <translation>Model contraction and ex&amp;pansion losses</translation>
        </message>
        <message>
            <source>Velocit&amp;y distribution coefficient based on conveyance</source>
            <translation>Velocit&amp;y distribution coefficient based on conveyance</translation>
        </message>
        <message>
            <source>Fr&amp;iction slope evaluation</source>
            <translation>Fr&amp;iction slope evaluation</translation>
        </message>
    </context>
    <context>
        <name>CReachLengthPage</name>
        <message>
            <source>Over bank reach lengths</source>
            <translation>Over bank reach lengths</translation>
        </message>
        <message>
            <source>&amp;Use energy equation</source>
            <translation>&amp;Use energy equation</translation>
        </message>
        <message>
            <source>Load &amp;branch and chainages</source>
            <translation>Load &amp;branch and chainages</translation>
        </message>
    </context>
    <context>
        <name>CSearchDlg</name>
        <message>
            <source>Search</source>
            <translation>Search</translation>
        </message>
        <message>
            <source>River Name</source>
            <translation>River Name</translation>
        </message>
        <message>
            <source>River &amp;name:</source>
            <translation>River &amp;name:</translation>
        </message>
        <message>
            <source>&amp;Partial match</source>
            <translation>&amp;Partial match</translation>
        </message>
        <message>
            <source>&amp;Full match</source>
            <translation>&amp;Full match</translation>
        </message>
        <message>
            <source>Chainage</source>
            <translation>Chainage</translation>
        </message>
        <message>
            <source>&amp;Chainage:</source>
            <translation>&amp;Chainage:</translation>
        </message>
        <message>
            <source>&lt;</source>
            <translation>&lt;</translation>
        </message>
        <message>
            <source>Less than</source>
            <translation>Less than</translation>
        </message>
        <message>
            <source>=</source>
            <translation>=</translation>
        </message>
        <message>
            <source>Equal to</source>
            <translation>Equal to</translation>
        </message>
        <message>
            <source>&gt;</source>
            <translation>&gt;</translation>
        </message>
        <message>
            <source>Greater than</source>
            <translation>Greater than</translation>
        </message>
        <message>
            <source>Not &amp;Use</source>
            <translation>Not &amp;Use</translation>
        </message>
    </context>
    <context>
        <name>CStratificationPage</name>
        <message>
            <source>&amp;No. of layers</source>
            <translation>&amp;No. of layers</translation>
        </message>
        <message>
            <source>&amp;Densities calculated</source>
            <translation>&amp;Densities calculated</translation>
        </message>
        <message>
            <source>Turbulence model</source>
            <translation>Turbulence model</translation>
        </message>
        <message>
            <source>V&amp;iscosity</source>
            <translation>V&amp;iscosity</translation>
        </message>
        <message>
            <source>Turb&amp;ulence model in fluid</source>
            <translation>Turb&amp;ulence model in fluid</translation>
        </message>
        <message>
            <source>constant</source>
            <translation>constant</translation>
        </message>
        <message>
            <source>mixing-length</source>
            <translation>mixing-length</translation>
        </message>
        <message>
            <source>k model</source>
            <translation>k model</translation>
        </message>
        <message>
            <source>k-eps model</source>
            <translation>k-eps model</translation>
        </message>
        <message>
            <source>Turbulence model at &amp;bed</source>
            <translation>Turbulence model at &amp;bed</translation>
        </message>
        <message>
            <source>drag coefficient</source>
            <translation>drag coefficient</translation>
        </message>
        <message>
            <source>Corrections (reductions)</source>
            <translation>Corrections (reductions)</translation>
        </message>
        <message>
            <source>&amp;Richardson numbers correction</source>
            <translation>&amp;Richardson numbers correction</translation>
        </message>
        <message>
            <source>Baroclinic Pressure</source>
            <translation>Baroclinic Pressure</translation>
        </message>
        <message>
            <source>Fa&amp;ctor</source>
            <translation>Fa&amp;ctor</translation>
        </message>
        <message>
            <source>L&amp;ocal bed slope</source>
            <translation>L&amp;ocal bed slope</translation>
        </message>
        <message>
            <source>Convection / Advection</source>
            <translation>Convection / Advection</translation>
        </message>
        <message>
            <source>Factor hori&amp;zontal momentum</source>
            <translation>Factor hori&amp;zontal momentum</translation>
        </message>
        <message>
            <source>Factor vertical &amp;momentum</source>
            <translation>Factor vertical &amp;momentum</translation>
        </message>
        <message>
            <source>Factor &amp;advection</source>
            <translation>Factor &amp;advection</translation>
        </message>
        <message>
            <source>Dispersion</source>
            <translation>Dispersion</translation>
        </message>
        <message>
            <source>Factor horizontal vi&amp;scosity</source>
            <translation>Factor horizontal vi&amp;scosity</translation>
        </message>
        <message>
            <source>Factor vertical viscosit&amp;y</source>
            <translation>Factor vertical viscosit&amp;y</translation>
        </message>
    </context>
    <context>
        <name>CTextOutputPage</name>
        <message>
            <source>&amp;Generate time series output files</source>
            <translation>&amp;Generate time series output files</translation>
        </message>
        <message>
            <source>Output files</source>
            <translation>Output files</translation>
        </message>
        <message>
            <source>Text file settings</source>
            <translation>Text file settings</translation>
        </message>
        <message>
            <source>&amp;Delimiter in output file</source>
            <translation>&amp;Delimiter in output file</translation>
        </message>
        <message>
            <source>&amp;Minimum</source>
            <translation>&amp;Minimum</translation>
        </message>
        <message>
            <source>Ma&amp;ximum</source>
            <translation>Ma&amp;ximum</translation>
        </message>
        <message>
            <source>Time &amp;of minimum</source>
            <translation>Time &amp;of minimum</translation>
        </message>
        <message>
            <source>&amp;Time of maximum</source>
            <translation>&amp;Time of maximum</translation>
        </message>
        <message>
            <source>Time period in output</source>
            <translation>Time period in output</translation>
        </message>
        <message>
            <source>&amp;Start</source>
            <translation>&amp;Start</translation>
        </message>
        <message>
            <source>Items in output</source>
            <translation>Items in output</translation>
        </message>
        <message>
            <source>Grid points in output</source>
            <translation>Grid points in output</translation>
        </message>
        <message>
            <source>Selected grid points in output</source>
            <translation>Selected grid points in output</translation>
        </message>
        <message>
            <source>&amp;All</source>
            <translation>&amp;All</translation>
        </message>
        <message>
            <source>Only from the l&amp;ist</source>
            <translation>Only from the l&amp;ist</translation>
        </message>
        <message>
            <source>All ex&amp;cepted those from the list</source>
            <translation>All ex&amp;cepted those from the list</translation>
        </message>
        <message>
            <source>Width of col&amp;umns</source>
            <translation>Width of col&amp;umns</translation>
        </message>
        <message>
            <source>Limited output &amp;period</source>
            <translation>Limited output &amp;period</translation>
        </message>
        <message>
            <source>E&amp;nd</source>
            <translation>E&amp;nd</translation>
        </message>
    </context>
    <context>
        <name>CWLCurvePage</name>
        <message>
            <source>System Definition</source>
            <translation>System Definition</translation>
        </message>
        <message>
            <source>Average &amp;Range</source>
            <translation>Average &amp;Range</translation>
        </message>
        <message>
            <source>&amp;Curvature Radius</source>
            <translation>&amp;Curvature Radius</translation>
        </message>
        <message>
            <source>Values</source>
            <translation>Values</translation>
        </message>
        <message>
            <source>Water level increment due to curve</source>
            <translation>Water level increment due to curve</translation>
        </message>
        <message>
            <source>Enabling water level &amp;increment due to curve</source>
            <translation>Enabling water level &amp;increment due to curve</translation>
        </message>
        <message>
            <source>Water &amp;Surface width</source>
            <translation>Water &amp;Surface width</translation>
        </message>
        <message>
            <source>Veloci&amp;ty</source>
            <translation>Veloci&amp;ty</translation>
        </message>
        <message>
            <source>Load &amp;Branch &amp;&amp; Chainage</source>
            <translation>Load &amp;Branch &amp;&amp; Chainage</translation>
        </message>
    </context>
    <context>
        <name>CWLMarkPage</name>
        <message>
            <source>Mark titles</source>
            <translation>Mark titles</translation>
        </message>
        <message>
            <source>Local values</source>
            <translation>Local values</translation>
        </message>
    </context>
    <context>
        <name>CWLSandBarsPage</name>
        <message>
            <source>Method</source>
            <translation>Method</translation>
        </message>
        <message>
            <source>&amp;Slope / Low Water channel Width / Water Area of Annual Max Discharge</source>
            <translation>&amp;Slope / Low Water channel Width / Water Area of Annual Max Discharge</translation>
        </message>
        <message>
            <source>&amp;dH (Observed)</source>
            <translation>&amp;dH (Observed)</translation>
        </message>
        <message>
            <source>Values</source>
            <translation>Values</translation>
        </message>
        <message>
            <source>Water level increment due to sand bars</source>
            <translation>Water level increment due to sand bars</translation>
        </message>
        <message>
            <source>Enabling water level &amp;increment due to sand bars</source>
            <translation>Enabling water level &amp;increment due to sand bars</translation>
        </message>
        <message>
            <source>Load &amp;Branch &amp;&amp; Chainage</source>
            <translation>Load &amp;Branch &amp;&amp; Chainage</translation>
        </message>
    </context>
    <context>
        <name>CWavePage</name>
        <message>
            <source>Wave Approximation</source>
            <translation>Wave Approximation</translation>
        </message>
        <message>
            <source>Global Value</source>
            <translation>Global Value</translation>
        </message>
        <message>
            <source>High Order Fully Dynamic</source>
            <translation>High Order Fully Dynamic</translation>
        </message>
        <message>
            <source>Fully Dynamic</source>
            <translation>Fully Dynamic</translation>
        </message>
        <message>
            <source>Diffusive Wave</source>
            <translation>Diffusive Wave</translation>
        </message>
        <message>
            <source>Kinematic Wave</source>
            <translation>Kinematic Wave</translation>
        </message>
        <message>
            <source>Local Values</source>
            <translation>Local Values</translation>
        </message>
        <message>
            <source>Wave &amp;Approximation:</source>
            <translation>Wave &amp;Approximation:</translation>
        </message>
    </context>
    <context>
        <name>CWindPage</name>
        <message>
            <source>Wind Factor</source>
            <translation>Wind Factor</translation>
        </message>
        <message>
            <source>&amp;Include wind</source>
            <translation>&amp;Include wind</translation>
        </message>
        <message>
            <source>Global Factor</source>
            <translation>Global Factor</translation>
        </message>
        <message>
            <source>To&amp;pographical Factor</source>
            <translation>To&amp;pographical Factor</translation>
        </message>
        <message>
            <source>Fri&amp;ction Factor</source>
            <translation>Fri&amp;ction Factor</translation>
        </message>
        <message>
            <source>Local Factors</source>
            <translation>Local Factors</translation>
        </message>
    </context>
    <context>
        <name>Kavo0_hd</name>
        <message>
            <source>R1</source>
            <translation>R1</translation>
        </message>
        <message>
            <source>R2</source>
            <translation>R2</translation>
        </message>
        <message>
            <source>Kvr_Help.chm
HDPar
KVR HD Parameters
KVR HD Parameters (*.hdkv)
.hdkv
HDPar.Document
HDPar Document</source>
            <translation>Kvr_Help.chm
HDPar
KVR HD Parameters
KVR HD Parameters (*.hdkv)
.hdkv
HDPar.Document
HDPar Document</translation>
        </message>
        <message>
            <source>h0</source>
            <translation>h0</translation>
        </message>
        <message>
            <source>h1</source>
            <translation>h1</translation>
        </message>
        <message>
            <source>Q0</source>
            <translation>Q0</translation>
        </message>
        <message>
            <source>Q1</source>
            <translation>Q1</translation>
        </message>
        <message>
            <source>Left bank</source>
            <translation>Left bank</translation>
        </message>
        <message>
            <source>Right bank</source>
            <translation>Right bank</translation>
        </message>
        <message>
            <source>River Name</source>
            <translation>River Name</translation>
        </message>
        <message>
            <source>Chainage</source>
            <translation>Chainage</translation>
        </message>
        <message>
            <source>Flood Pl. Res</source>
            <translation>Flood Pl. Res</translation>
        </message>
        <message>
            <source>Lines in the editor data-tables with none or only partially
filled information will be deleted when saving the editor file.
Proceed Yes/No ?</source>
            <translation>Lines in the editor data-tables with none or only partially
filled information will be deleted when saving the editor file.
Proceed Yes/No ?</translation>
        </message>
        <message>
            <source>Data deleted in Wave page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Wave page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data deleted in Init page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Init page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data deleted in Bed Resist. page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Bed Resist. page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data deleted in Wind page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Wind page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data deleted in Water Loss page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Water Loss page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data deleted in Flood Plain Resist. page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Flood Plain Resist. page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Init page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Init page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Bed Resist. page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Bed Resist. page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Wave page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Wave page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Wind page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Wind page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Water Loss page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Water Loss page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Flood Plain Resist. page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Flood Plain Resist. page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Can't select Wave page because of error on active page</source>
            <translation>Can't select Wave page because of error on active page</translation>
        </message>
        <message>
            <source>Can't select Init page because of error on active page</source>
            <translation>Can't select Init page because of error on active page</translation>
        </message>
        <message>
            <source>Can't select Bed Resist. page because of error on active page</source>
            <translation>Can't select Bed Resist. page because of error on active page</translation>
        </message>
        <message>
            <source>Can't select Wind page because of error on active page</source>
            <translation>Can't select Wind page because of error on active page</translation>
        </message>
        <message>
            <source>Can't select Water Loss page because of error on active page</source>
            <translation>Can't select Water Loss page because of error on active page</translation>
        </message>
        <message>
            <source>Can't select Flood Plain Resist. page because of error on active page</source>
            <translation>Can't select Flood Plain Resist. page because of error on active page</translation>
        </message>
        <message>
            <source>HD Parameters</source>
            <translation>HD Parameters</translation>
        </message>
        <message>
            <source> KVR HD Tools</source>
            <translation> KVR HD Tools</translation>
        </message>
        <message>
            <source>Unsupported file format</source>
            <translation>Unsupported file format</translation>
        </message>
        <message>
            <source>Kavo0 HD</source>
            <translation>Kavo0 HD</translation>
        </message>
        <message>
            <source>UpStr. Chainage</source>
            <translation>UpStr. Chainage</translation>
        </message>
        <message>
            <source>DnStr. Chainage</source>
            <translation>DnStr. Chainage</translation>
        </message>
        <message>
            <source>Approx.</source>
            <translation>Approx.</translation>
        </message>
        <message>
            <source>High Order Fully Dynamic
Fully Dynamic
Diffusive Wave
Kinematic Wave</source>
            <translation>High Order Fully Dynamic
Fully Dynamic
Diffusive Wave
Kinematic Wave</translation>
        </message>
        <message>
            <source>Data deleted in Mixing Coef. page, but to switch there, you must first repair error on active page</source>
            <translation>Data deleted in Mixing Coef. page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Data inserted in Mixing Coef. page, but to switch there, you must first repair error on active page</source>
            <translation>Data inserted in Mixing Coef. page, but to switch there, you must first repair error on active page</translation>
        </message>
        <message>
            <source>Can't select Mixing Coef. page because of error on active page</source>
            <translation>Can't select Mixing Coef. page because of error on active page</translation>
        </message>
        <message>
            <source>Leakage Coef</source>
            <translation>Leakage Coef</translation>
        </message>
        <message>
            <source>%1 already stands beside %2 and holds something else.
Replace it Yes/No ?</source>
            <translation>%1 already stands beside %2 and holds something else.
Replace it Yes/No ?</translation>
        </message>
        <message>
            <source>Removal of incomplete lines</source>
            <translation>Removal of incomplete lines</translation>
        </message>
        <message>
            <source>Line %1 of %2</source>
            <translation>Line %1 of %2</translation>
        </message>
        <message>
            <source>Searched item not found</source>
            <translation>Searched item not found</translation>
        </message>
        <message>
            <source>The last occurence of searched item already found</source>
            <translation>The last occurence of searched item already found</translation>
        </message>
        <message>
            <source>&amp;Insert Line</source>
            <translation>&amp;Insert Line</translation>
        </message>
        <message>
            <source>&amp;Delete Line</source>
            <translation>&amp;Delete Line</translation>
        </message>
        <message>
            <source>&amp;Go to Line...</source>
            <translation>&amp;Go to Line...</translation>
        </message>
        <message>
            <source>&amp;Search...</source>
            <translation>&amp;Search...</translation>
        </message>
        <message>
            <source>Search &amp;Again</source>
            <translation>Search &amp;Again</translation>
        </message>
        <message>
            <source>Insert &amp;Location from Network</source>
            <translation>Insert &amp;Location from Network</translation>
        </message>
        <message>
            <source>No network editor of the project has a picked location.
Pick a place on the network's map first.</source>
            <translation>No network editor of the project has a picked location.
Pick a place on the network's map first.</translation>
        </message>
        <message>
            <source>Initial h</source>
            <translation>Initial h</translation>
        </message>
        <message>
            <source>Initial y</source>
            <translation>Initial y</translation>
        </message>
        <message>
            <source>Initial Q</source>
            <translation>Initial Q</translation>
        </message>
        <message>
            <source>Initial</source>
            <translation>Initial</translation>
        </message>
        <message>
            <source>Floating point number required</source>
            <translation>Floating point number required</translation>
        </message>
        <message>
            <source>Invalid floating point number!</source>
            <translation>Invalid floating point number!</translation>
        </message>
        <message>
            <source>Floating-point value is out of range</source>
            <translation>Floating-point value is out of range</translation>
        </message>
        <message>
            <source>Please enter an integer.</source>
            <translation>Please enter an integer.</translation>
        </message>
        <message>
            <source>Line number must be greater than 0</source>
            <translation>Line number must be greater than 0</translation>
        </message>
        <message>
            <source>Nothing was pasted. Line %1, column "%2" cannot take "%3":
%4</source>
            <translation>Nothing was pasted. Line %1, column "%2" cannot take "%3":
%4</translation>
        </message>
        <message>
            <source>Nothing was pasted. The copied cells are %1 columns wide; from column "%2" on the table has only %3.</source>
            <translation>Nothing was pasted. The copied cells are %1 columns wide; from column "%2" on the table has only %3.</translation>
        </message>
        <message>
            <source>The cell is locked.</source>
            <translation>The cell is locked.</translation>
        </message>
        <message>
            <source>Change of cells</source>
            <translation>Change of cells</translation>
        </message>
        <message>
            <source>Insertion of lines</source>
            <translation>Insertion of lines</translation>
        </message>
        <message>
            <source>Deletion of lines</source>
            <translation>Deletion of lines</translation>
        </message>
        <message>
            <source>Paste</source>
            <translation>Paste</translation>
        </message>
        <message>
            <source>Change of a value</source>
            <translation>Change of a value</translation>
        </message>
        <message>
            <source>Loading of locations</source>
            <translation>Loading of locations</translation>
        </message>
        <message>
            <source>Next cell; behind the last one a new line</source>
            <translation>Next cell; behind the last one a new line</translation>
        </message>
        <message>
            <source>Previous cell</source>
            <translation>Previous cell</translation>
        </message>
        <message>
            <source>Insert line</source>
            <translation>Insert line</translation>
        </message>
        <message>
            <source>Copy, then insert line</source>
            <translation>Copy, then insert line</translation>
        </message>
        <message>
            <source>Paste, then insert line</source>
            <translation>Paste, then insert line</translation>
        </message>
        <message>
            <source>Delete selected lines</source>
            <translation>Delete selected lines</translation>
        </message>
        <message>
            <source>Copy</source>
            <translation>Copy</translation>
        </message>
        <message>
            <source>Search again</source>
            <translation>Search again</translation>
        </message>
        <message>
            <source>Search</source>
            <translation>Search</translation>
        </message>
        <message>
            <source>Undo</source>
            <translation>Undo</translation>
        </message>
        <message>
            <source>Redo</source>
            <translation>Redo</translation>
        </message>
        <message>
            <source>Wind</source>
            <translation>Wind</translation>
        </message>
        <message>
            <source>Topographical factor</source>
            <translation>Topographical factor</translation>
        </message>
        <message>
            <source>Default Values</source>
            <translation>Default Values</translation>
        </message>
        <message>
            <source>Heat Balance</source>
            <translation>Heat Balance</translation>
        </message>
        <message>
            <source>Stratification</source>
            <translation>Stratification</translation>
        </message>
        <message>
            <source>Groundwater Leakage</source>
            <translation>Groundwater Leakage</translation>
        </message>
        <message>
            <source>Flood Plain Resist.</source>
            <translation>Flood Plain Resist.</translation>
        </message>
        <message>
            <source>Water Loss</source>
            <translation>Water Loss</translation>
        </message>
        <message>
            <source>Water Loss %1</source>
            <translation>Water Loss %1</translation>
        </message>
        <message>
            <source>One of these is required: %1</source>
            <translation>One of these is required: %1</translation>
        </message>
        <message>
            <source>No lines. Insert adds one.</source>
            <translation>No lines. Insert adds one.</translation>
        </message>
        <message>
            <source>Wave Approx</source>
            <translation>Wave Approx</translation>
        </message>
        <message>
            <source>Quasi Steady</source>
            <translation>Quasi Steady</translation>
        </message>
        <message>
            <source>Bed Resist.</source>
            <translation>Bed Resist.</translation>
        </message>
        <message>
            <source>Bed Resist. Toolbox</source>
            <translation>Bed Resist. Toolbox</translation>
        </message>
        <message>
            <source>Mixing Coef.</source>
            <translation>Mixing Coef.</translation>
        </message>
        <message>
            <source>Encroachment</source>
            <translation>Encroachment</translation>
        </message>
        <message>
            <source>Contraction</source>
            <translation>Contraction</translation>
        </message>
        <message>
            <source>Expansion</source>
            <translation>Expansion</translation>
        </message>
        <message>
            <source>Resistance</source>
            <translation>Resistance</translation>
        </message>
        <message>
            <source>Zone 1</source>
            <translation>Zone 1</translation>
        </message>
        <message>
            <source>Zone 2</source>
            <translation>Zone 2</translation>
        </message>
        <message>
            <source>Zone 3</source>
            <translation>Zone 3</translation>
        </message>
        <message>
            <source>Coef. a</source>
            <translation>Coef. a</translation>
        </message>
        <message>
            <source>Coef. b</source>
            <translation>Coef. b</translation>
        </message>
        <message>
            <source>Minimum</source>
            <translation>Minimum</translation>
        </message>
        <message>
            <source>Maximum</source>
            <translation>Maximum</translation>
        </message>
        <message>
            <source>Velocity</source>
            <translation>Velocity</translation>
        </message>
        <message>
            <source>Width/depth</source>
            <translation>Width/depth</translation>
        </message>
        <message>
            <source>Coefficient f</source>
            <translation>Coefficient f</translation>
        </message>
        <message>
            <source>f%1</source>
            <translation>f%1</translation>
        </message>
        <message>
            <source>Method
Banks
Left offset
Right offset
Left position
Right position
Width
Reduction
Total reduction
Left reduction
Right reduction
Target level
Target energy</source>
            <translation>Method
Banks
Left offset
Right offset
Left position
Right position
Width
Reduction
Total reduction
Left reduction
Right reduction
Target level
Target energy</translation>
        </message>
        <message>
            <source>1 Fixed positions
2 Fixed width
3 Conveyance reduction
4 Target level
5 Target level and energy</source>
            <translation>1 Fixed positions
2 Fixed width
3 Conveyance reduction
4 Target level
5 Target level and energy</translation>
        </message>
        <message>
            <source>1 Both banks
2 Left bank
3 Right bank</source>
            <translation>1 Both banks
2 Left bank
3 Right bank</translation>
        </message>
        <message>
            <source>1 Equal on both banks
2 In proportion to conveyance
3 Bank by bank</source>
            <translation>1 Equal on both banks
2 In proportion to conveyance
3 Bank by bank</translation>
        </message>
        <message>
            <source>Stored as %1.</source>
            <translation>Stored as %1.</translation>
        </message>
        <message>
            <source>Set-up %1</source>
            <translation>Set-up %1</translation>
        </message>
        <message>
            <source>This set-up will not be saved as it is: its second line or a later one needs a branch name and a chainage.</source>
            <translation>This set-up will not be saved as it is: its second line or a later one needs a branch name and a chainage.</translation>
        </message>
        <message>
            <source>There is no set-up yet. Add makes one.</source>
            <translation>There is no set-up yet. Add makes one.</translation>
        </message>
        <message>
            <source>Addition of a set-up</source>
            <translation>Addition of a set-up</translation>
        </message>
        <message>
            <source>Deletion of a set-up</source>
            <translation>Deletion of a set-up</translation>
        </message>
        <message>
            <source>Branches and chainages come from the cross section and network editors of the project.
This document belongs to no project, so there is nothing to load.</source>
            <translation>Branches and chainages come from the cross section and network editors of the project.
This document belongs to no project, so there is nothing to load.</translation>
        </message>
        <message>
            <source>No cross section or network editor of the project has answered.
Nothing was loaded.</source>
            <translation>No cross section or network editor of the project has answered.
Nothing was loaded.</translation>
        </message>
        <message>
            <source>Add. Output</source>
            <translation>Add. Output</translation>
        </message>
        <message>
            <source>KLR Parameters</source>
            <translation>KLR Parameters</translation>
        </message>
        <message>
            <source>KLR Initial</source>
            <translation>KLR Initial</translation>
        </message>
        <message>
            <source>Reach Lengths</source>
            <translation>Reach Lengths</translation>
        </message>
        <message>
            <source>%1 locations added, %2 were there already; %3 of these have new values.</source>
            <translation>%1 locations added, %2 were there already; %3 of these have new values.</translation>
        </message>
        <message>
            <source>Search for river name/topo ID.
Search</source>
            <translation>Search for river name/topo ID.
Search</translation>
        </message>
        <message>
            <source>Search for next occurence of river name/ topo ID.
Find Next</source>
            <translation>Search for next occurence of river name/ topo ID.
Find Next</translation>
        </message>
        <message>
            <source>Default name
User defined name
No decimals</source>
            <translation>Default name
User defined name
No decimals</translation>
        </message>
        <message>
            <source>Format
Auto name
Filename
Browse</source>
            <translation>Format
Auto name
Filename
Browse</translation>
        </message>
        <message>
            <source>Interpolate</source>
            <translation>Interpolate</translation>
        </message>
        <message>
            <source>Global</source>
            <translation>Global</translation>
        </message>
        <message>
            <source>kvt Timeseries Bridge
Ascii Format 1 Timeseries Bridge
Ascii Format 2 Timeseries Bridge</source>
            <translation>kvt Timeseries Bridge
Ascii Format 1 Timeseries Bridge
Ascii Format 2 Timeseries Bridge</translation>
        </message>
        <message>
            <source>None
Single
Multiple 1
Multiple 2
Multiple ½</source>
            <translation>None
Single
Multiple 1
Multiple 2
Multiple ½</translation>
        </message>
        <message>
            <source>Filename
Browse
Item no.
Order</source>
            <translation>Filename
Browse
Item no.
Order</translation>
        </message>
        <message>
            <source>X Orig.
Y Orig.
Rotation
Grid Size
J Cells no.
K Cells no.
Filename
Browse
Type
Item
Component no.
Storing frequency
Default period
Start time
End time</source>
            <translation>X Orig.
Y Orig.
Rotation
Grid Size
J Cells no.
K Cells no.
Filename
Browse
Type
Item
Component no.
Storing frequency
Default period
Start time
End time</translation>
        </message>
        <message>
            <source>Max
Min
Dynamic</source>
            <translation>Max
Min
Dynamic</translation>
        </message>
        <message>
            <source>Water level
Water depth
Velocity
Velocity * Depth
AD component
DEM
(h,p,q)</source>
            <translation>Water level
Water depth
Velocity
Velocity * Depth
AD component
DEM
(h,p,q)</translation>
        </message>
        <message>
            <source>%1 locations added, %2 were there already.</source>
            <translation>%1 locations added, %2 were there already.</translation>
        </message>
        <message>
            <source>Invalid DateTime</source>
            <translation>Invalid DateTime</translation>
        </message>
        <message>
            <source>"%1" is no date and time. Expected one such as %2.</source>
            <translation>"%1" is no date and time. Expected one such as %2.</translation>
        </message>
        <message>
            <source>Please enter 0 or 1.</source>
            <translation>Please enter 0 or 1.</translation>
        </message>
        <message>
            <source>%1 already exists.
The simulation will write over it. Use this name?</source>
            <translation>%1 already exists.
The simulation will write over it. Use this name?</translation>
        </message>
        <message>
            <source>Choose a File</source>
            <translation>Choose a File</translation>
        </message>
        <message>
            <source>Rows without a file name (%1) are left out when the file is saved.</source>
            <translation>Rows without a file name (%1) are left out when the file is saved.</translation>
        </message>
        <message>
            <source>Mark title</source>
            <translation>Mark title</translation>
        </message>
        <message>
            <source>Average Range</source>
            <translation>Average Range</translation>
        </message>
        <message>
            <source>Water Width</source>
            <translation>Water Width</translation>
        </message>
        <message>
            <source>Radius</source>
            <translation>Radius</translation>
        </message>
        <message>
            <source>Slope of Bed Channel</source>
            <translation>Slope of Bed Channel</translation>
        </message>
        <message>
            <source>Width of Low Water Channel</source>
            <translation>Width of Low Water Channel</translation>
        </message>
        <message>
            <source>Area of Low Water Channel</source>
            <translation>Area of Low Water Channel</translation>
        </message>
        <message>
            <source>dH (Observed)</source>
            <translation>dH (Observed)</translation>
        </message>
        <message>
            <source>User Def. Marks</source>
            <translation>User Def. Marks</translation>
        </message>
        <message>
            <source>W. L. Incr. - Curves</source>
            <translation>W. L. Incr. - Curves</translation>
        </message>
        <message>
            <source>W. L. Incr. - Sand Bars</source>
            <translation>W. L. Incr. - Sand Bars</translation>
        </message>
        <message>
            <source>Time Series Output</source>
            <translation>Time Series Output</translation>
        </message>
        <message>
            <source>Maps</source>
            <translation>Maps</translation>
        </message>
        <message>
            <source>File name</source>
            <translation>File name</translation>
        </message>
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
Center X-Y coordinates
Left X-Y coordinates
Right X-Y coordinates
User defined marks</translation>
        </message>
        <message>
        <source>At most %1 characters fit in here; the end of what was typed or pasted is missing.</source>
        <translation>At most %1 characters fit in here; the end of what was typed or pasted is missing.</translation>
    </message>
    <message>
        <source>%1: &quot;%2&quot; was typed.</source>
        <translation>%1: &quot;%2&quot; was typed.</translation>
    </message>
    <message>
        <source>Allowed: %1</source>
        <translation>Allowed: %1</translation>
    </message>
    <message>
        <source>%1 to %2</source>
        <translation>%1 to %2</translation>
    </message>
    <message>
        <source>at least %1</source>
        <translation>at least %1</translation>
    </message>
    <message>
        <source>at most %1</source>
        <translation>at most %1</translation>
    </message>
    <message>
        <source>%1, line %2</source>
        <translation>%1, line %2</translation>
    </message>
    <message>
        <source>Select the line</source>
        <translation>Select the line</translation>
    </message>
        <message>
            <source>%1 does not exist.
The simulation will look for it. Use this name?</source>
            <translation>%1 does not exist.
The simulation will look for it. Use this name?</translation>
        </message>
        <message>
            <source>Could not write &quot;%1&quot;: %2.</source>
            <translation>Could not write &quot;%1&quot;: %2.</translation>
        </message>
        <message>
            <source>Could not read &quot;%1&quot;: %2.</source>
            <translation>Could not read &quot;%1&quot;: %2.</translation>
        </message>
        <message>
            <source>The new content is complete in &quot;%1&quot;.</source>
            <translation>The new content is complete in &quot;%1&quot;.</translation>
        </message>
        <message>
            <source>%1 is now %2</source>
            <translation>%1 is now %2</translation>
        </message>
        <message>
            <source>%1 could not be read when it was opened; what is shown is not its content.
Saving replaces it. As it is now it stays in a copy beside it, %2.
Save?</source>
            <translation>%1 could not be read when it was opened; what is shown is not its content.
Saving replaces it. As it is now it stays in a copy beside it, %2.
Save?</translation>
        </message>
        <message>
            <source>%1 holds values that were not taken as they stand (places: %2).
Saving writes what is shown instead. As it is now the file stays in a copy beside it, %3.
Save?</source>
            <translation>%1 holds values that were not taken as they stand (places: %2).
Saving writes what is shown instead. As it is now the file stays in a copy beside it, %3.
Save?</translation>
        </message>
        <message>
            <source>%1 could not be read. What is shown here are default values, not its content.
%2</source>
            <translation>%1 could not be read. What is shown here are default values, not its content.
%2</translation>
        </message>
        <message>
            <source>Values of %1 that were not taken as they stand: %2. A save keeps the file as it is in a copy.</source>
            <translation>Values of %1 that were not taken as they stand: %2. A save keeps the file as it is in a copy.</translation>
        </message>
        <message>
            <source>The file as it was before this save is kept in %1.</source>
            <translation>The file as it was before this save is kept in %1.</translation>
        </message>
        <message>
            <source>Show List...</source>
            <translation>Show List...</translation>
        </message>
        <message>
            <source>Edit Default Values</source>
            <translation>Edit Default Values</translation>
        </message>
        <message>
            <source>Close this bar</source>
            <translation>Close this bar</translation>
        </message>
        <message>
            <source>%1: Values Not Taken as They Stand</source>
            <translation>%1: Values Not Taken as They Stand</translation>
        </message>
        <message>
            <source>These places of %1 are not written as they should be. Each row says what stands there, what was expected, and what is used instead. Nothing is changed in the file unless you save; a save keeps the file as it is in a copy.</source>
            <translation>These places of %1 are not written as they should be. Each row says what stands there, what was expected, and what is used instead. Nothing is changed in the file unless you save; a save keeps the file as it is in a copy.</translation>
        </message>
        <message>
            <source>Line
Column
Section
Keyword
Parameter
In the file
Expected
Used instead</source>
            <translation>Line
Column
Section
Keyword
Parameter
In the file
Expected
Used instead</translation>
        </message>
        <message>
            <source>a number
an integer
true or false
a text in quotes
a file name in &lt; &gt;
six integers
a count that fits the %1 parameters behind it
a flag for each of %1 titles
a target [%1]
more parameters, or a smaller count
only one of this name; the first counts</source>
            <translation>a number
an integer
true or false
a text in quotes
a file name in &lt; &gt;
six integers
a count that fits the %1 parameters behind it
a flag for each of %1 titles
a target [%1]
more parameters, or a smaller count
only one of this name; the first counts</translation>
        </message>
        <message>
            <source>&amp;Copy</source>
            <translation>&amp;Copy</translation>
        </message>
        <message>
            <source>C&amp;lose</source>
            <translation>C&amp;lose</translation>
        </message>
        <message>
            <source>Full value: %1</source>
            <translation>Full value: %1</translation>
        </message>
        <message>
            <source>Line %1 of %2, %3: %4</source>
            <translation>Line %1 of %2, %3: %4</translation>
        </message>
        <message>
            <source>Resistance = a·(V·R)^b, between minimum and maximum. V is the velocity in m/s, R the hydraulic radius in m.</source>
            <translation>Resistance = a·(V·R)^b, between minimum and maximum. V is the velocity in m/s, R the hydraulic radius in m.</translation>
        </message>
        <message>
            <source>The formula changes from %1 to %2. Convert the values too (M = 1/n)?

Yes changes %3 values, for example %4 to %5: the global values, all lines, and the coefficients, bounds and tables of the toolbox.
No leaves every value as it is. Flood plain resistances stay as they are in any case.</source>
            <translation>The formula changes from %1 to %2. Convert the values too (M = 1/n)?

Yes changes %3 values, for example %4 to %5: the global values, all lines, and the coefficients, bounds and tables of the toolbox.
No leaves every value as it is. Flood plain resistances stay as they are in any case.</translation>
        </message>
        <message>
            <source>The formula changes from %1 to %2.

Between the two no value can be converted without a hydraulic radius, so all %3 values stay as they are.</source>
            <translation>The formula changes from %1 to %2.

Between the two no value can be converted without a hydraulic radius, so all %3 values stay as they are.</translation>
        </message>
        <message>
            <source>Conversion of resistances</source>
            <translation>Conversion of resistances</translation>
        </message>
        <message>
            <source>In a field</source>
            <translation>In a field</translation>
        </message>
        <message>
            <source>Takes what is typed</source>
            <translation>Takes what is typed</translation>
        </message>
        <message>
            <source>Takes back what is typed</source>
            <translation>Takes back what is typed</translation>
        </message>
        <message>
            <source>In a table</source>
            <translation>In a table</translation>
        </message>
        <message>
            <source>Undone: %1</source>
            <translation>Undone: %1</translation>
        </message>
        <message>
            <source>Redone: %1</source>
            <translation>Redone: %1</translation>
        </message>
        <message>
            <source>Line inserted</source>
            <translation>Line inserted</translation>
        </message>
        <message>
            <source>%1 lines inserted</source>
            <translation>%1 lines inserted</translation>
        </message>
        <message>
            <source>Line deleted</source>
            <translation>Line deleted</translation>
        </message>
        <message>
            <source>%1 lines deleted</source>
            <translation>%1 lines deleted</translation>
        </message>
        <message>
            <source>1 cell pasted</source>
            <translation>1 cell pasted</translation>
        </message>
        <message>
            <source>%1 cells pasted</source>
            <translation>%1 cells pasted</translation>
        </message>
        <message>
            <source>Saved</source>
            <translation>Saved</translation>
        </message>
        <message>
            <source>Saved; %1 (undo brings back what was dropped)</source>
            <translation>Saved; %1 (undo brings back what was dropped)</translation>
        </message>
        <message>
            <source>, </source>
            <translation>, </translation>
        </message>
        <message>
            <source>1 line without location dropped</source>
            <translation>1 line without location dropped</translation>
        </message>
        <message>
            <source>%1 lines without location dropped</source>
            <translation>%1 lines without location dropped</translation>
        </message>
        <message>
            <source>1 mark without title dropped</source>
            <translation>1 mark without title dropped</translation>
        </message>
        <message>
            <source>%1 marks without title dropped</source>
            <translation>%1 marks without title dropped</translation>
        </message>
        <message>
            <source>1 row without file name dropped</source>
            <translation>1 row without file name dropped</translation>
        </message>
        <message>
            <source>%1 rows without file name dropped</source>
            <translation>%1 rows without file name dropped</translation>
        </message>
        <message>
            <source>Marks without a title (%1) and the levels below them are left out when the file is saved.</source>
            <translation>Marks without a title (%1) and the levels below them are left out when the file is saved.</translation>
        </message>
        <message>
            <source>1 encroachment set-up without a filled second line was not written</source>
            <translation>1 encroachment set-up without a filled second line was not written</translation>
        </message>
        <message>
            <source>%1 encroachment set-ups without a filled second line were not written</source>
            <translation>%1 encroachment set-ups without a filled second line were not written</translation>
        </message>
</context>
</TS>
