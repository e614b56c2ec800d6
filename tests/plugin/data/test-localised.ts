<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fi">
<context>
    <name></name>
    <message id="quorvanepelkan-test-both">
        <source>both</source>
        <translation>lokalisoitu</translation>
    </message>
</context>
</TS>
