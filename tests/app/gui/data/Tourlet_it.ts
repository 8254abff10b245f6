<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it">
<context>
    <name>Greeting</name>
    <message>
        <source>Hello</source>
        <translation>Ciao</translation>
    </message>
</context>
</TS>
