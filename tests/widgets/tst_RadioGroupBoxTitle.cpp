// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The title, compared with that of a stock group box.

#include "TestCase.h"

#include <VelRadioGroupBox.h>

#include <QImage>
#include <QProxyStyle>
#include <QStyleFactory>
#include <QStyleOptionGroupBox>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

class OpenBox : public VelRadioGroupBox
{
    Q_OBJECT

public:
    using VelRadioGroupBox::VelRadioGroupBox;

    QRect labelRect() const { return rectOf(QStyle::SC_GroupBoxLabel); }
    QRect rectOf(QStyle::SubControl part) const
    {
        QStyleOptionGroupBox option;
        initStyleOption(&option);
        return style()->subControlRect(QStyle::CC_GroupBox, &option, part, this);
    }
};

// A radio box and a stock box that look alike but for their indicators.
struct Pair
{
    explicit Pair(const QString &title, Qt::LayoutDirection direction = Qt::LeftToRight)
        : radio(title, &window)
        , native(title, &window)
    {
        native.setCheckable(true);
        native.setChecked(false);
        for (QGroupBox *box : boxes()) {
            box->setLayoutDirection(direction);
            box->resize(260, 90);
        }
    }

    QVector<QGroupBox *> boxes() { return {&radio, &native}; }
    QImage label(QGroupBox &box) { return box.grab().toImage().copy(radio.labelRect()); }

    QWidget window;
    OpenBox radio;
    QGroupBox native;
};

bool has(const QImage &image, const QColor &color)
{
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) == color)
                return true;
        }
    }
    return false;
}

} // namespace

class tst_RadioGroupBoxTitle : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void liesWhereTheStyleHasIt_data();
    void liesWhereTheStyleHasIt();
    void liesWhereAProxyOfTheStyleHasIt();
    void hasTheColorsOfAStyleSheet_data();
    void hasTheColorsOfAStyleSheet();
    void liesWhereTheStyleHasItUnderAStyleSheet();
    void hasOneFrameUnderAStyleSheet_data();
    void hasOneFrameUnderAStyleSheet();
};

void tst_RadioGroupBoxTitle::liesWhereTheStyleHasIt_data()
{
    QTest::addColumn<QString>("styleName");
    QTest::addColumn<QString>("title");
    QTest::addColumn<Qt::LayoutDirection>("direction");
    for (const char *style : {"Fusion", "Windows", "Breeze"}) {
        if (!QStyleFactory::keys().contains(QLatin1String(style), Qt::CaseInsensitive))
            continue;
        for (const char *title : {"Title", "&Title", "Salt && pepper", "A longer title with a &mark"}) {
            QTest::addRow("%s, %s", style, title) << s(style) << s(title) << Qt::LeftToRight;
            QTest::addRow("%s, %s, right to left", style, title) << s(style) << s(title) << Qt::RightToLeft;
        }
    }
}

void tst_RadioGroupBoxTitle::liesWhereTheStyleHasIt()
{
    QFETCH(QString, styleName);
    QFETCH(QString, title);
    QFETCH(Qt::LayoutDirection, direction);
    const QScopedPointer<QStyle> style(QStyleFactory::create(styleName));
    Pair pair(title, direction);
    for (QGroupBox *box : pair.boxes())
        box->setStyle(style.data());
    QCOMPARE(pair.label(pair.radio), pair.label(pair.native));
}

void tst_RadioGroupBoxTitle::liesWhereAProxyOfTheStyleHasIt()
{
    QProxyStyle style(QStyleFactory::create(s("Fusion")));
    Pair pair(s("A &title"));
    for (QGroupBox *box : pair.boxes())
        box->setStyle(&style);
    QCOMPARE(pair.label(pair.radio), pair.label(pair.native));
}

void tst_RadioGroupBoxTitle::hasTheColorsOfAStyleSheet_data()
{
    QTest::addColumn<QString>("sheet");
    QTest::addColumn<bool>("isEnabled");
    QTest::newRow("title") << s("QGroupBox::title { color: #ff0000; }") << true;
    QTest::newRow("class and title") << s("VelRadioGroupBox::title { color: #ff0000; }"
                                          "QGroupBox { border: 1px solid gray; margin-top: 20px; }")
                                     << true;
    QTest::newRow("disabled") << s("QGroupBox::title { color: blue; }"
                                   "QGroupBox::title:disabled { color: #ff0000; }")
                              << false;
    QTest::newRow("background") << s("QGroupBox::title { background: #ff0000; }") << true;
}

void tst_RadioGroupBoxTitle::hasTheColorsOfAStyleSheet()
{
    QFETCH(QString, sheet);
    QFETCH(bool, isEnabled);
    Pair pair(s("A &title IIII HHHH"));
    pair.window.setStyleSheet(sheet);
    for (QGroupBox *box : pair.boxes()) {
        box->setEnabled(isEnabled);
        box->ensurePolished();
    }
    QVERIFY(has(pair.label(pair.radio), QColor(Qt::red)));
}

void tst_RadioGroupBoxTitle::liesWhereTheStyleHasItUnderAStyleSheet()
{
    Pair pair(s("A &title"));
    // Has nothing to say about these boxes.
    pair.window.setStyleSheet(s("QPushButton { color: red; }"));
    QCOMPARE(pair.label(pair.radio), pair.label(pair.native));

    pair.window.setStyleSheet(s("QGroupBox { border: 1px solid gray; margin-top: 20px; }"
                                "QGroupBox::title { subcontrol-origin: margin; color: blue; left: 12px; }"));
    QCOMPARE(pair.label(pair.radio), pair.label(pair.native));
}

void tst_RadioGroupBoxTitle::hasOneFrameUnderAStyleSheet_data()
{
    QTest::addColumn<QString>("sheet");
    QTest::addColumn<Qt::LayoutDirection>("direction");
    const QPair<const char *, const char *> sheets[] = {
        {"border", "QGroupBox { border: 2px solid #ff0000; }"},
        {"border, margin", "QGroupBox { border: 1px solid #ff0000; margin-top: 12px; }"},
        {"border, margins, corners",
         "QGroupBox { border: 3px solid #ff0000; border-radius: 5px; margin: 14px 6px 5px 7px; }"},
        {"border, title",
         "QGroupBox { border: 1px solid #ff0000; margin-top: 8px; }"
         "QGroupBox::title { subcontrol-origin: margin; left: 10px; padding: 0 3px; }"},
        {"border, title in the middle",
         "QGroupBox { border: 1px solid #ff0000; margin-top: 8px; }"
         "QGroupBox::title { subcontrol-position: top center; }"},
        {"border, title with a background",
         "QGroupBox { border: 1px solid #ff0000; margin-top: 10px; }"
         "QGroupBox::title { background: #00ff00; }"},
    };
    for (const auto &sheet : sheets) {
        QTest::addRow("%s", sheet.first) << s(sheet.second) << Qt::LeftToRight;
        QTest::addRow("%s, right to left", sheet.first) << s(sheet.second) << Qt::RightToLeft;
    }
}

void tst_RadioGroupBoxTitle::hasOneFrameUnderAStyleSheet()
{
    QFETCH(QString, sheet);
    QFETCH(Qt::LayoutDirection, direction);
    Pair pair(s("A &title"), direction);
    pair.window.setStyleSheet(sheet);
    const QImage radio = pair.radio.grab().toImage();
    const QImage native = pair.native.grab().toImage();
    // The frame is cut out around the title, too.
    const QRect title =
        (pair.radio.labelRect() | pair.radio.rectOf(QStyle::SC_GroupBoxCheckBox)).adjusted(-4, 0, 4, 0);
    int lines = 0;
    for (int y = 0; y < native.height(); ++y) {
        for (int x = 0; x < native.width(); ++x) {
            if (title.contains(x, y))
                continue;
            lines += native.pixelColor(x, y) == QColor(Qt::red);
            if (radio.pixel(x, y) != native.pixel(x, y))
                QFAIL(qPrintable(s("another color at %1, %2").arg(x).arg(y)));
        }
    }
    QVERIFY(lines > 300);
}

VEL_TEST_MAIN(tst_RadioGroupBoxTitle)

#include "tst_RadioGroupBoxTitle.moc"
