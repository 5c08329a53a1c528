// The city picker, compared with pictures that somebody has looked at.

#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"

namespace {

class CityPickerPictureTest : public CityPickerFixture {
protected:
    void SetUp() override {
        CityPickerFixture::SetUp();
        // The world changes with the packages that it is made of; these cities stay.
        worldOf({"IDS_CITY_US_OREGON_BAKER_CITY", "IDS_CITY_BR_PARAIBA_JOAO_PESSOA",
                 "IDS_CITY_DE_BERLIN_BERLIN", "IDS_CITY_US_NEW_HAMPSHIRE_BERLIN",
                 "IDS_CITY_TR_CORLU", "IDS_CITY_JO_AL_AQABAH", "IDS_CITY_NP_KATHMANDU",
                 "IDS_CITY_SG_SINGAPORE", "IDS_CITY_CA_NUNAVUT_BAKER_LAKE",
                 "IDS_CITY_US_CALIFORNIA_BAKERSFIELD", "IDS_CITY_US_MONTANA_BAKER",
                 "IDS_CITY_NU_ALOFI", "IDS_CITY_US_HAWAII_HONOLULU"});
        openPicker();
    }
};

TEST_F(CityPickerPictureTest, AllCities) {
    stage().expectPicture("cities");
}

TEST_F(CityPickerPictureTest, TheSearchTextIsHighlighted) {
    search("ber");
    stage().key("Return");
    stage().settle();
    stage().expectPicture("cities-found");
}

TEST_F(CityPickerPictureTest, NothingIsFound) {
    search("qqxx");
    stage().key("Return");
    stage().settle();
    stage().expectPicture("cities-not-found");
}

} // namespace
