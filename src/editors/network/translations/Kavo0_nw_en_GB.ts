<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
<context>
    <name>CImportDialog</name>
    <message>
        <source>as in the file, taken as meters</source>
        <translation>as in the file, taken as metres</translation>
    </message>
</context>
<context>
    <name>ImportReport</name>
    <message>
        <source>The layer names no coordinate system: its numbers are taken as meters on a map.</source>
        <translation>The layer names no coordinate system: its numbers are taken as metres on a map.</translation>
    </message>
</context>
<context>
    <name>GisSystems</name>
    <message>
        <source>%1 is in degrees: distances along a branch need a map in meters.</source>
        <translation>%1 is in degrees: distances along a branch need a map in metres.</translation>
    </message>
</context>
</TS>
