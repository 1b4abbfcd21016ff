<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en" sourcelanguage="en">
<context>
    <name>zandor::designer::StepName</name>
    <message numerus="yes">
        <source>Delete %n table(s)</source>
        <translation>
            <numerusform>Delete %n table</numerusform>
            <numerusform>Delete %n tables</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Add %n table(s)</source>
        <translation>
            <numerusform>Add %n table</numerusform>
            <numerusform>Add %n tables</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Resize %n table(s)</source>
        <translation>
            <numerusform>Resize %n table</numerusform>
            <numerusform>Resize %n tables</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Move %n table(s)</source>
        <translation>
            <numerusform>Move %n table</numerusform>
            <numerusform>Move %n tables</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Add %n join(s)</source>
        <translation>
            <numerusform>Add %n join</numerusform>
            <numerusform>Add %n joins</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Delete %n join(s)</source>
        <translation>
            <numerusform>Delete %n join</numerusform>
            <numerusform>Delete %n joins</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Change %n column(s)</source>
        <translation>
            <numerusform>Change %n column</numerusform>
            <numerusform>Change %n columns</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Add %n column(s)</source>
        <translation>
            <numerusform>Add %n column</numerusform>
            <numerusform>Add %n columns</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Delete %n column(s)</source>
        <translation>
            <numerusform>Delete %n column</numerusform>
            <numerusform>Delete %n columns</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Move %n column(s)</source>
        <translation>
            <numerusform>Move %n column</numerusform>
            <numerusform>Move %n columns</numerusform>
        </translation>
    </message>
</context>
</TS>
