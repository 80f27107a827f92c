<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<!--
SPDX-FileCopyrightText: The veluiextra developers
SPDX-License-Identifier: LGPL-2.1-or-later
-->
<TS version="2.1" language="de_DE">
<context>
    <name>VelMenuView</name>
    <message>
        <source>New entry</source>
        <translation>Eintrag von nebenan</translation>
    </message>
</context>
</TS>
