#include "hub/project/geojson.h"
#include "tests/hub/colours.h"
#include "tests/hub/project/shown_map.h"

namespace {

using kota::hub::MapColours;
using kota::test::contrast;
using kota::test::darkPalette;
using kota::test::ShownMap;

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
