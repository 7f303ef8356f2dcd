#include "hub/project/geojson.h"
#include "tests/hub/project/shown_map.h"

namespace {

using kota::hub::MapColours;
using kota::test::ShownMap;

QPalette darkPalette() {
    QPalette palette(QColor(0x35, 0x35, 0x35));
    palette.setColor(QPalette::Base, QColor(0x23, 0x23, 0x23));
    palette.setColor(QPalette::Highlight, QColor(0x2a, 0x82, 0xda));
    for (const QPalette::ColorRole role : {QPalette::Text, QPalette::WindowText, QPalette::ButtonText})
        palette.setColor(role, Qt::white);
    return palette;
}

// By the usual formula: 1 for equal colours, 21 for black and white.
double contrast(const QColor& left, const QColor& right) {
    const auto linear = [](double part) {
        return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    const auto luminance = [&](const QColor& colour) {
        return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) +
               0.0722 * linear(colour.blueF());
    };
    const auto [darker, lighter] = std::minmax({luminance(left), luminance(right)});
    return (lighter + 0.05) / (darker + 0.05);
}

// The example's map in a light and in a dark window, on a plain and on a fine screen.
class APicture : public ShownMap, public testing::WithParamInterface<bool> {
protected:
    APicture() {
        map.setPalette(GetParam() ? darkPalette() : QPalette());
        map.resize(900, 700);
        const auto reading = kota::hub::readNetwork(KOTA_EXAMPLES "/missouri/network.geojson");
        EXPECT_EQ(reading.error, "");
        map.showNetwork(reading.network);
        network = reading.network;
        map.show();
    }

    bool take(const char* name, double ratio = 1) {
        QImage image(map.size() * ratio, QImage::Format_RGB32);
        image.setDevicePixelRatio(ratio);
        map.render(&image);
        QDir().mkpath(KOTA_PICTURES);
        const QString path = QString(KOTA_PICTURES "/map_%1_%2.png").arg(name, GetParam() ? "dark" : "light");
        return image.save(path);
    }

    std::shared_ptr<const kota::hub::Network> network;
};

TEST_P(APicture, OfTheExampleCanBeRead) {
    map.setCurrentLocation("PLATTE", 12'000);
    const auto omaha = network->place("MISSOURI", 187'328);
    ASSERT_TRUE(omaha.has_value());
    click(at(*omaha));
    ASSERT_TRUE(map.picked().has_value());
    EXPECT_NEAR(map.picked()->chainage, 187'328, 300);
    EXPECT_TRUE(take("all"));
    EXPECT_TRUE(take("fine", 2));
    turnWheel(map.viewPort().toScreen(*omaha), 6);
    EXPECT_TRUE(take("near"));
    map.showNetwork(nullptr);
    EXPECT_TRUE(take("empty"));
}

TEST_P(APicture, HasColoursThatStandOut) {
    const MapColours in(map.palette());
    for (const QColor& text : {in.riverName, in.markText, in.text, in.hint})
        EXPECT_GT(contrast(text, in.ground), 4.5) << text.name().toStdString();
    for (const QColor& drawn : {in.river, in.mark, in.pin, in.current})
        EXPECT_GT(contrast(drawn, in.ground), 3) << drawn.name().toStdString();
    EXPECT_GT(pixelsOf(in.ground, picture(), map.rect()), 400'000);
}

INSTANTIATE_TEST_SUITE_P(Palettes, APicture, testing::Bool());

} // namespace
