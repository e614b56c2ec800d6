<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en">
<context>
    <name></name>
    <message id="quorvanepelkan-bt-accept">
        <source>Accept</source>
        <extracomment>Button that accepts a dialog</extracomment>
        <translation>Accept</translation>
    </message>
    <message id="quorvanepelkan-bt-cancel">
        <source>Cancel</source>
        <extracomment>Button that closes a dialog without accepting it</extracomment>
        <translation>Cancel</translation>
    </message>
    <message id="quorvanepelkan-he-back">
        <source>Back</source>
        <extracomment>Page header hint for going back to the previous page</extracomment>
        <translation>Back</translation>
    </message>
    <message id="quorvanepelkan-la-no-items">
        <source>No items</source>
        <extracomment>Placeholder of an empty list</extracomment>
        <translation>No items</translation>
    </message>
</context>
</TS>
