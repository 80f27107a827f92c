// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <VelRadioGroupBox.h>

#include <QImage>
#include <QPainter>
#include <QProxyStyle>
#include <QStyleFactory>
#include <QStyleOption>
#include <QVBoxLayout>

#include <algorithm>
#include <cstdlib>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

// Draws as the style of a name does and writes down what it was asked to draw.
class RecordingStyle : public QProxyStyle
{
    Q_OBJECT

public:
    struct Primitive
    {
        PrimitiveElement element;
        QRect rect;
        State state;
        bool isButton;
        QRegion clip;
        QStyleOptionFrame frame; // for frames alone
    };
    struct Text
    {
        QRect rect;
        int flags;
        bool enabled;
        QString text;
        QPalette::ColorRole role;
        QColor pen;
    };

    explicit RecordingStyle(const QString &name)
        : QProxyStyle(QStyleFactory::create(name))
    {
    }

    void drawPrimitive(PrimitiveElement element, const QStyleOption *option, QPainter *painter,
                       const QWidget *widget) const override
    {
        const auto *frame = qstyleoption_cast<const QStyleOptionFrame *>(option);
        if (qobject_cast<const VelRadioGroupBox *>(widget)) {
            order.append(element);
            primitives.append({element, option->rect, option->state,
                               qstyleoption_cast<const QStyleOptionButton *>(option) != nullptr,
                               painter->hasClipping() ? painter->clipRegion() : QRegion(),
                               frame ? *frame : QStyleOptionFrame()});
        }
        QProxyStyle::drawPrimitive(element, option, painter, widget);
    }

    void drawItemText(QPainter *painter, const QRect &rect, int flags, const QPalette &palette, bool enabled,
                      const QString &text, QPalette::ColorRole role) const override
    {
        order.append(text);
        texts.append({rect, flags, enabled, text, role, painter->pen().color()});
        QProxyStyle::drawItemText(painter, rect, flags, palette, enabled, text, role);
    }

    int styleHint(StyleHint hint, const QStyleOption *option, const QWidget *widget,
                  QStyleHintReturn *data) const override
    {
        if (hint == SH_UnderlineShortcut)
            return underlines;
        if (hint == SH_GroupBox_TextLabelColor && labelColor.isValid())
            return int(labelColor.rgba());
        return QProxyStyle::styleHint(hint, option, widget, data);
    }

    QVector<Primitive> all(PrimitiveElement element) const
    {
        QVector<Primitive> result;
        for (const Primitive &primitive : qAsConst(primitives)) {
            if (primitive.element == element)
                result.append(primitive);
        }
        return result;
    }

    void forget()
    {
        primitives.clear();
        texts.clear();
        order.clear();
    }

    mutable QVector<Primitive> primitives;
    mutable QVector<Text> texts;
    mutable QVariantList order; // primitives by number, texts
    bool underlines = true;
    QColor labelColor;
};

class OpenBox : public VelRadioGroupBox
{
    Q_OBJECT

public:
    using VelRadioGroupBox::VelRadioGroupBox;

    QRect rectOf(QStyle::SubControl part) const
    {
        QStyleOptionGroupBox option;
        initStyleOption(&option);
        return style()->subControlRect(QStyle::CC_GroupBox, &option, part, this);
    }
};

struct Form
{
    explicit Form(const QString &styleName)
        : style(styleName)
        , one(new OpenBox(s("&Title of the box"), &window))
        , two(new OpenBox(s("Other"), &window))
    {
        auto *layout = new QVBoxLayout(&window);
        for (OpenBox *box : {one, two}) {
            box->setStyle(&style);
            layout->addWidget(box);
        }
        window.resize(300, 200);
    }

    void draw()
    {
        window.grab(); // lays it out
        style.forget();
        one->grab();
    }

    RecordingStyle style; // outlives the widgets
    QWidget window;
    OpenBox *const one;
    OpenBox *const two;
};

// Where a clip has several rectangles, as around the title, Qt 6 rounds a blended color in another way.
constexpr int Rounding = QT_VERSION_MAJOR >= 6 ? 1 : 0;

// Of one channel of one pixel.
int largestDifference(const QImage &one, const QImage &other)
{
    int largest = 0;
    for (int y = 0; y < one.height(); ++y) {
        for (int x = 0; x < one.width(); ++x) {
            const QRgb a = one.pixel(x, y);
            const QRgb b = other.pixel(x, y);
            largest = std::max({largest, std::abs(qRed(a) - qRed(b)), std::abs(qGreen(a) - qGreen(b)),
                                std::abs(qBlue(a) - qBlue(b)), std::abs(qAlpha(a) - qAlpha(b))});
        }
    }
    return largest;
}

QImage picture(QGroupBox &box)
{
    box.resize(260, 90);
    return box.grab().toImage();
}

} // namespace

class tst_RadioGroupBoxDrawing : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void drawsARadioButtonAndNoCheckBox_data();
    void drawsARadioButtonAndNoCheckBox();
    void tellsTheStyleTheStateOfTheRadioButton();
    void cutsTheTitleOutOfTheFrame_data();
    void cutsTheTitleOutOfTheFrame();
    void drawsTheWholeFrameWithoutATitle();
    void tellsTheStyleTheKindOfTheFrame();
    void drawsInTheOrderOfTheCommonStyle();
    void drawsAFocusFrameAroundTitleAndIndicator();
    void underlinesTheMnemonicAsTheStyleSays();
    void drawsTheTitleInTheColorOfTheStyle();
    void looksLikeTheNativeBoxOutsideOfItsTitle_data();
    void looksLikeTheNativeBoxOutsideOfItsTitle();
};

void tst_RadioGroupBoxDrawing::drawsARadioButtonAndNoCheckBox_data()
{
    QTest::addColumn<QString>("styleName");
    QTest::addColumn<Qt::LayoutDirection>("direction");
    for (const char *name : {"Fusion", "Windows", "Breeze"}) {
        if (!QStyleFactory::keys().contains(QLatin1String(name), Qt::CaseInsensitive))
            continue;
        QTest::addRow("%s", name) << s(name) << Qt::LeftToRight;
        QTest::addRow("%s, right to left", name) << s(name) << Qt::RightToLeft;
    }
}

void tst_RadioGroupBoxDrawing::drawsARadioButtonAndNoCheckBox()
{
    QFETCH(QString, styleName);
    QFETCH(Qt::LayoutDirection, direction);
    Form form(styleName);
    form.window.setLayoutDirection(direction);
    form.draw();

    const auto radioButtons = form.style.all(QStyle::PE_IndicatorRadioButton);
    QCOMPARE(radioButtons.size(), 1);
    QCOMPARE(radioButtons.constFirst().rect, form.one->rectOf(QStyle::SC_GroupBoxCheckBox));
    QVERIFY(radioButtons.constFirst().isButton);
    QVERIFY(form.style.all(QStyle::PE_IndicatorCheckBox).isEmpty());

    const auto frames = form.style.all(QStyle::PE_FrameGroupBox);
    QCOMPARE(frames.size(), 1);
    QCOMPARE(frames.constFirst().rect, form.one->rectOf(QStyle::SC_GroupBoxFrame));
    QCOMPARE(form.style.texts.size(), 1);
    QCOMPARE(form.style.texts.constFirst().rect, form.one->rectOf(QStyle::SC_GroupBoxLabel));
    QCOMPARE(form.style.texts.constFirst().text, s("&Title of the box"));
    QVERIFY(form.style.all(QStyle::PE_FrameFocusRect).isEmpty());
}

void tst_RadioGroupBoxDrawing::tellsTheStyleTheStateOfTheRadioButton()
{
    Form form(s("Fusion"));
    form.draw();
    QStyle::State state = form.style.all(QStyle::PE_IndicatorRadioButton).constFirst().state;
    QVERIFY(state & QStyle::State_Off);
    QVERIFY(state & QStyle::State_Enabled);
    QVERIFY(!(state & (QStyle::State_On | QStyle::State_Sunken)));

    form.one->setChecked(true);
    form.draw();
    state = form.style.all(QStyle::PE_IndicatorRadioButton).constFirst().state;
    QVERIFY(state & QStyle::State_On);
    QVERIFY(!(state & QStyle::State_Off));

    QTest::mousePress(form.one, Qt::LeftButton, Qt::NoModifier,
                      form.one->rectOf(QStyle::SC_GroupBoxCheckBox).center());
    form.draw();
    QVERIFY(form.style.all(QStyle::PE_IndicatorRadioButton).constFirst().state & QStyle::State_Sunken);

    form.one->setEnabled(false);
    form.draw();
    QVERIFY(!(form.style.all(QStyle::PE_IndicatorRadioButton).constFirst().state & QStyle::State_Enabled));
    QVERIFY(!form.style.texts.constFirst().enabled);
}

void tst_RadioGroupBoxDrawing::cutsTheTitleOutOfTheFrame_data()
{
    drawsARadioButtonAndNoCheckBox_data();
}

void tst_RadioGroupBoxDrawing::cutsTheTitleOutOfTheFrame()
{
    QFETCH(QString, styleName);
    QFETCH(Qt::LayoutDirection, direction);
    Form form(styleName);
    form.window.setLayoutDirection(direction);
    form.draw();
    const QRegion clip = form.style.all(QStyle::PE_FrameGroupBox).constFirst().clip;
    const QRect title =
        form.one->rectOf(QStyle::SC_GroupBoxCheckBox) | form.one->rectOf(QStyle::SC_GroupBoxLabel);
    QVERIFY(!clip.intersects(title));
    const bool leftToRight = direction == Qt::LeftToRight;
    const QRect gap = title.adjusted(leftToRight ? -4 : 0, 0, leftToRight ? 0 : 4, 0);
    QCOMPARE(clip, QRegion(form.one->rect()) - gap);
    // What comes after the frame is drawn everywhere.
    QVERIFY(form.style.all(QStyle::PE_IndicatorRadioButton).constFirst().clip.isEmpty()
            || form.style.all(QStyle::PE_IndicatorRadioButton)
                   .constFirst()
                   .clip.contains(form.one->rectOf(QStyle::SC_GroupBoxCheckBox)));
}

void tst_RadioGroupBoxDrawing::drawsTheWholeFrameWithoutATitle()
{
    Form form(s("Fusion"));
    form.one->setTitle(QString());
    form.draw();
    QCOMPARE(form.style.all(QStyle::PE_FrameGroupBox).constFirst().clip, QRegion(form.one->rect()));
    QVERIFY(form.style.texts.isEmpty());
    QCOMPARE(form.style.all(QStyle::PE_IndicatorRadioButton).size(), 1);
}

void tst_RadioGroupBoxDrawing::tellsTheStyleTheKindOfTheFrame()
{
    Form form(s("Fusion"));
    for (const bool isFlat : {false, true}) {
        form.one->setFlat(isFlat);
        form.draw();
        const QStyleOptionFrame frame = form.style.all(QStyle::PE_FrameGroupBox).constFirst().frame;
        QCOMPARE(bool(frame.features & QStyleOptionFrame::Flat), isFlat);
        QCOMPARE(frame.lineWidth, 1);
        QCOMPARE(frame.midLineWidth, 0);
    }
}

void tst_RadioGroupBoxDrawing::drawsInTheOrderOfTheCommonStyle()
{
    Form form(s("Windows"));
    form.window.show();
    form.window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&form.window));
    form.one->setFocus(Qt::TabFocusReason);
    form.draw();
    QCOMPARE(form.style.order,
             QVariantList({int(QStyle::PE_FrameGroupBox), s("&Title of the box"),
                           int(QStyle::PE_FrameFocusRect), int(QStyle::PE_IndicatorRadioButton)}));
}

void tst_RadioGroupBoxDrawing::drawsAFocusFrameAroundTitleAndIndicator()
{
    Form form(s("Windows"));
    form.window.show();
    form.window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&form.window));
    form.one->setFocus(Qt::TabFocusReason);
    form.draw();
    const auto focus = form.style.all(QStyle::PE_FrameFocusRect);
    QCOMPARE(focus.size(), 1);
    QCOMPARE(focus.constFirst().rect,
             form.one->rectOf(QStyle::SC_GroupBoxCheckBox) | form.one->rectOf(QStyle::SC_GroupBoxLabel));
    form.two->setFocus(Qt::TabFocusReason);
    form.draw();
    QVERIFY(form.style.all(QStyle::PE_FrameFocusRect).isEmpty());
}

void tst_RadioGroupBoxDrawing::underlinesTheMnemonicAsTheStyleSays()
{
    Form form(s("Fusion"));
    form.draw();
    QVERIFY(form.style.texts.constFirst().flags & Qt::TextShowMnemonic);
    QVERIFY(!(form.style.texts.constFirst().flags & Qt::TextHideMnemonic));
    form.style.underlines = false;
    form.draw();
    QVERIFY(form.style.texts.constFirst().flags & Qt::TextHideMnemonic);
}

void tst_RadioGroupBoxDrawing::drawsTheTitleInTheColorOfTheStyle()
{
    Form form(s("Fusion"));
    form.style.labelColor = Qt::red;
    form.draw();
    QCOMPARE(form.style.texts.constFirst().role, QPalette::NoRole);
    QCOMPARE(form.style.texts.constFirst().pen, QColor(Qt::red));
}

void tst_RadioGroupBoxDrawing::looksLikeTheNativeBoxOutsideOfItsTitle_data()
{
    drawsARadioButtonAndNoCheckBox_data();
}

void tst_RadioGroupBoxDrawing::looksLikeTheNativeBoxOutsideOfItsTitle()
{
    QFETCH(QString, styleName);
    QFETCH(Qt::LayoutDirection, direction);
    const QScopedPointer<QStyle> style(QStyleFactory::create(styleName));
    QWidget window;
    window.setStyle(style.data());
    OpenBox radio(s("Title"), &window);
    QGroupBox native(s("Title"), &window);
    native.setCheckable(true);
    native.setChecked(false);
    for (QGroupBox *box : {static_cast<QGroupBox *>(&radio), &native}) {
        box->setStyle(style.data());
        box->setLayoutDirection(direction);
    }
    const QImage radioPicture = picture(radio);
    const QImage nativePicture = picture(native);
    QCOMPARE(radioPicture.size(), nativePicture.size());

    // The band of the title is where the two may differ.
    const QRect title = radio.rectOf(QStyle::SC_GroupBoxCheckBox) | radio.rectOf(QStyle::SC_GroupBoxLabel);
    QVERIFY(title.bottom() < 40);
    const QRect below(0, title.bottom() + 1, radioPicture.width(),
                      radioPicture.height() - title.bottom() - 1);
    QVERIFY(largestDifference(radioPicture.copy(below), nativePicture.copy(below)) <= Rounding);
    QVERIFY(radioPicture != nativePicture);
}

VEL_TEST_MAIN(tst_RadioGroupBoxDrawing)

#include "tst_RadioGroupBoxDrawing.moc"
