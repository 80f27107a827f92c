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

    QRect labelRect() const
    {
        QStyleOptionGroupBox option;
        initStyleOption(&option);
        return style()->subControlRect(QStyle::CC_GroupBox, &option, QStyle::SC_GroupBoxLabel, this);
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

VEL_TEST_MAIN(tst_RadioGroupBoxTitle)

#include "tst_RadioGroupBoxTitle.moc"
