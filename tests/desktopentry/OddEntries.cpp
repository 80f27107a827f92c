// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddEntries.h"

#include <QHash>
#include <QRandomGenerator>

namespace {

using Validator::Sample;

QByteArrayList list(const char *lines)
{
    QByteArrayList all = QByteArray(lines).split('\n');
    all.removeAll({});
    return all;
}

// Values with what the escapes of the file make of them, one a line.
const char *const Commands = R"(
a
a b
a "b
a b"
a "b c"
a 'b c'
a 'b
a 'b"c'
a "b'c"
a `b`
a $b
a \\$b
a "\\$b"
a "$b"
a "`"
a "\\`"
a "b \\"c\\" d"
a ~
~/b
a <b
a >b
a |b
a | b
a && b
a ; b
http://x?a=b&c=d
a *
a ?
a #
a (b)
a !b{c}[d]=^
a \\b
a \\\\b
/opt/My\ App/run
a \tb
a \sb
a	b
a \b
a "\\\\"
a "\\b"
a "\\"
a "\\""
a "\b"
a\
a\\\
"a b" c
"a"b
a"b"
a b"c"d
"a
"
""
a ""
a %f
a %F
a %u
a %U %i %c %k %%
a %
a %d %D
a %n %N %v %m
a %x
a %1
a %-
a % f
a %f%f
a %f %f
a %f %u
a %F %U %u
a %i %i
a %c %c
a "%f"
a "%c d"
a "%x"
a b%f
a %Fb
a --x=%U
a '%f'
%f
%c a
a %\\f
a \\%f
a \\%
a "\\%f"
a "%"
a %"f"
a "b;c"
a b\;c
a \"b
a \\"b
a \\\"b"
a "\"
 a
a 
sh -c 'echo "$HOME" | cat'
sh -c "echo \\$HOME | cat" %f
env A=b a
VELWM_X ' %x
äöü
a "ä
/a b/c %f
a $HOME/x "$HOME/y z"
a $(b)
a 5"
a don't
)";

const char *const Lists = R"(
a;
a
a;a;
;
a;;b;
;a;
Game
game;
Game;Office;
GAME ;
Audio;
Video;Audio;
AudioVideo;Audio;
TrayIcon;
Screensaver;Game;
Application;Game;
KidsGames;
X-;
X-Foo;x-foo;
NumericalAnalysis;
Scanning;OCR;
G\same;
a\;b;
Ä;
GNOME;
gnome;
GNOME;Foo;
 KDE ;
VEL;
X-VEL;
KDE;KDE;
text/plain;
text/plain;image/png;text/plain;
TEXT/Plain;
text/plain, image/png;
text/plain; charset=x;
text;
text/;
/plain;
text/*;
*/*;
text/pl ain;
foo/bar;
x-foo/bar;
X-Foo/bar;
x- /a;
x-scheme-handler/http;
x-directory/normal;
message/x;
multipart/x;
example/x;
text/ä;
text/a/b;
text/a@b;
text/a]b;
text/a+b.c_d-e!f#g$h&i^j;
new;
new;new;
new;old;
a b;
a_b;
ö;
-;
)";

const char *const Texts = R"(
a
A
a 
\sa
a.png
a.svg
a.xpm
.png
a.PNG
a.svgz
ä.png
x/a
./a.png
../a
~/a
~
/x/a.png
/x/a
a b
a	b
http://www.example.org
www.example.org
example.org/x
mailto:a
/tmp
file:///nowhere
file:/nowhere
$HOME
"/a"
a\qb
a\
a\nb
äöü
1.0
1.4
1.5
1.6
2.0
0.9.4
x
true
false
True
yes
no
1
0
on
 true
true 
UTF-8
utf-8
Legacy-Mixed
Application
application
Link
Directory
FSDevice
Service
MimeType
X-Own
if-exists a
if-exists /a
if-exists
unless-exists a
GNOME
GNOME /a/b
GNOME3 a
GNOME3 if-session a
GSettings a
GSettings a b
KDE a:b:c
Foo a
)";

const char *const Names = R"(
Type
Version
Name
GenericName
NoDisplay
Comment
Icon
Hidden
OnlyShowIn
NotShowIn
DBusActivatable
TryExec
Exec
Path
Terminal
Actions
MimeType
Categories
Implements
Keywords
StartupNotify
StartupWMClass
URL
PrefersNonDefaultGPU
SingleMainWindow
AutostartCondition
Encoding
SortOrder
Patterns
DefaultApp
MiniIcon
Protocols
Extensions
BinaryPattern
MapNotify
FilePattern
SwallowTitle
SwallowExec
TerminalOptions
ServiceTypes
DocPath
InitialPreference
Dev
FSType
MountPoint
ReadOnly
UnmountIcon
X-Own
x-own
Own
Exec[de]
Type[de]
Name[de]
Name[en_GB]
Name[sr@latin]
Name[de_DE.UTF-8@euro]
Name[]
Name[de
Name[d e]
Name[d|]
Comment[|]
Name[ö]
Name[de][fr]
Comment[de]
Icon[de]
Keywords[de]
X-Own[de]
Own[de]
Na me
Na_me
Näme
)";

const char *const Lines = R"(
foo
foo bar
=a
 =a
 Comment=b
	Comment=b
 # a
#a
# a=b
[X-Own]
[X-Own] 
 [X-Own]
[X-Own]x
[X-Own
[X-Ö]
[Own]
[x-own]
[]
[a[b]
[a]b]
[a]=b
[Desktop Entry]
[Desktop Entry ]
[KDE Desktop Entry]
[Desktop Action new]
[Desktop Action other]
[Desktop Action a b]
[Desktop Action ö]
[Desktop Action ]
[Desktop Action]
Comment = b
Comment	=b
)";

const QByteArrayList &commands()
{
    static const QByteArrayList all = list(Commands);
    return all;
}

const QByteArrayList &lists()
{
    static const QByteArrayList all = list(Lists);
    return all;
}

const QByteArrayList &texts()
{
    static const QByteArrayList all =
        list(Texts) + QByteArrayList{"", "\x01", "a\x7f", "a\xff", "\xc3", "a\xc2\x85"};
    return all;
}

const QByteArrayList &names()
{
    static const QByteArrayList all = list(Names);
    return all;
}

const QByteArrayList &lines()
{
    static const QByteArrayList all = list(Lines);
    return all;
}

QByteArray application(const QByteArray &exec)
{
    return "[Desktop Entry]\nType=Application\nName=Program\nExec=" + exec + '\n';
}

QByteArray entry(const QByteArray &type)
{
    if (type == "Application")
        return application("true");
    const QByteArray target = type == "Link" ? QByteArrayLiteral("URL=http://example.org\n") : QByteArray();
    return "[Desktop Entry]\nType=" + type + "\nName=Thing\n" + target;
}

QByteArray withValue(const QByteArray &bytes, const QByteArray &key, const QByteArray &value)
{
    QByteArrayList all = bytes.split('\n');
    for (QByteArray &line : all) {
        if (line.startsWith(key + '='))
            return line = key + '=' + value, all.join('\n');
    }
    return bytes + key + '=' + value + '\n';
}

void addValues(QVector<Sample> *samples)
{
    const QString file = QStringLiteral("a.desktop");
    for (const QByteArray &command : commands()) {
        samples->append({file, application(command)});
        samples->append(
            {file,
             application("true") + "Actions=new;\n[Desktop Action new]\nName=New\nExec=" + command + '\n'});
    }
    const QByteArray actions = "[Desktop Action new]\nName=New\nExec=true\n";
    for (const char *key :
         {"Categories", "MimeType", "OnlyShowIn", "NotShowIn", "Actions", "Keywords", "Implements"}) {
        for (const QByteArray &value : lists())
            samples->append({file, withValue(entry("Application"), key, value) + actions});
    }
    for (const QByteArray &name : names()) {
        for (const QByteArray &value : texts())
            samples->append({file, withValue(entry("Application"), name, value)});
    }
}

void addKeys(QVector<Sample> *samples)
{
    for (const char *type :
         {"Application", "Link", "Directory", "FSDevice", "Service", "MimeType", "Own", ""}) {
        const QString file =
            qstrcmp(type, "Directory") == 0 ? QStringLiteral(".directory") : QStringLiteral("a.desktop");
        samples->append({file, entry(type)});
        for (const QByteArray &name : names()) {
            samples->append({file, withValue(entry(type), name, "x")});
            samples->append({file, entry(type) + name + "=x\n" + name + "=y\n"});
            samples->append({file, entry(type) + "Actions=new;\n[Desktop Action new]\n" + name + "=x\n"});
            samples->append({file, entry(type) + "[X-Own]\n" + name + "=x\n" + name + "=x\n"});
        }
    }
}

void addLines(QVector<Sample> *samples)
{
    const QString file = QStringLiteral("a.desktop");
    const QByteArray bytes = entry("Application");
    for (const QByteArray &line : lines()) {
        samples->append({file, line + '\n' + bytes});
        samples->append({file, bytes + line + '\n'});
        samples->append({file, bytes + line + "\nName=a\nExec=a\nFoo=b\n"});
    }
    QByteArray other = bytes;
    samples->append({file, other.replace('\n', "\r\n")});
    other = bytes;
    samples->append({file, other.replace('\n', '\r')});
    const QByteArrayList whole{
        "",
        "\n",
        "# a\n",
        "a",
        "Name=a\n",
        "[X-Own]\n",
        "\xef\xbb\xbf" + bytes,
        bytes.chopped(1),
        bytes + "Comment=a\rb\n",
        bytes + "\f\n",
        bytes + "# \xff\n",
        "[Desktop Entry]\n",
        "[Desktop Entry]\nType=Application\nExec=true\nName[de]=x\n",
        "[Desktop Entry]\nType=Application\nExec=true\nName[de]=x\nName[en]=y\nKeywords[fr]=a;b;\n",
        bytes + "OnlyShowIn=GNOME;\nNotShowIn=KDE;\n",
        bytes + "OnlyShowIn=\nNotShowIn=\n",
        bytes + "Categories=TrayIcon;\nOnlyShowIn=KDE;\n",
        bytes + "Comment=program\nGenericName=Program\n"};
    for (const QByteArray &text : whole)
        samples->append({file, text});
}

void addFileNames(QVector<Sample> *samples)
{
    for (const char *name :
         {"foo.desktop", "org.example.Foo.desktop", "org.example.foo-bar.desktop", "foo.bar.desktop",
          "org.1foo.bar.desktop", "org..bar.desktop", "a.desktop.desktop", "foo", "foo.txt", "foo.DESKTOP",
          "foo.directory", ".directory", ".desktop", "foo.desktop.bak", "a.kdelnk"}) {
        for (const char *type : {"Application", "Directory", "Link", "Own"}) {
            samples->append({QString::fromLatin1(name), entry(type)});
            samples->append({QString::fromLatin1(name), entry(type) + "DBusActivatable=true\n"});
        }
    }
}

template <typename List>
auto oneOf(const List &all, QRandomGenerator *random)
{
    return all.at(random->bounded(all.size()));
}

QByteArray otherValue(const QByteArray &name, QRandomGenerator *random)
{
    const bool isList = QByteArrayList{"Categories", "MimeType", "OnlyShowIn", "NotShowIn",
                                       "Actions",    "Keywords", "Implements"}
                            .contains(name);
    switch (random->bounded(8)) {
    case 0:
        return oneOf(commands(), random);
    case 1:
        return oneOf(lists(), random);
    case 2:
        return oneOf(texts(), random);
    default:
        return name == "Exec" ? oneOf(commands(), random)
            : isList          ? oneOf(lists(), random)
                              : oneOf(texts(), random);
    }
}

void changeLine(QByteArrayList *all, QRandomGenerator *random)
{
    const int at = random->bounded(all->size());
    QByteArray &line = (*all)[at];
    const int equals = line.indexOf('=');
    switch (random->bounded(7)) {
    case 0:
        all->removeAt(at);
        break;
    case 1:
        all->insert(at, oneOf(lines(), random));
        break;
    case 2:
        all->insert(at, line);
        break;
    case 3:
        all->insert(at, oneOf(names(), random) + '=' + otherValue({}, random));
        break;
    case 4:
        line = oneOf(names(), random) + line.mid(qMax(equals, 0));
        break;
    default:
        line = line.left(equals + 1) + otherValue(line.left(qMax(equals, 0)), random);
    }
}

void changeByte(QByteArray *bytes, QRandomGenerator *random)
{
    static const QByteArray odd("\"'\\`$<>~|&;*?#()%%%%[]= \t\n\r\x01\x7f\xff/.,:-_@xXfFuUdDick\xc3\xa4");
    const int at = random->bounded(bytes->size());
    switch (random->bounded(3)) {
    case 0:
        bytes->remove(at, 1 + random->bounded(3));
        break;
    case 1:
        bytes->insert(at, odd.at(random->bounded(odd.size())));
        break;
    default:
        (*bytes)[at] = odd.at(random->bounded(odd.size()));
    }
}

} // namespace

QVector<Sample> OddEntries::all()
{
    QVector<Sample> samples;
    addValues(&samples);
    addKeys(&samples);
    addLines(&samples);
    addFileNames(&samples);
    return samples;
}

QByteArray OddEntries::changed(const QByteArray &bytes, QRandomGenerator *random)
{
    QByteArray result = bytes;
    const int changes = 1 + random->bounded(3);
    for (int i = 0; i < changes && !result.isEmpty(); ++i) {
        if (random->bounded(2) == 0) {
            changeByte(&result, random);
        } else {
            QByteArrayList all = result.split('\n');
            changeLine(&all, random);
            result = all.join('\n');
        }
    }
    return result;
}
