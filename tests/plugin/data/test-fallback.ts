<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en">
<context>
    <name></name>
    <message id="quorvanepelkan-test-both">
        <source>both</source>
        <translation>from the fallback</translation>
    </message>
    <message id="quorvanepelkan-test-fallback-only">
        <source>fallback only</source>
        <translation>only in the fallback</translation>
    </message>
</context>
</TS>
