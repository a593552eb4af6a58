#include <cmath>
#include <limits>

#include "CityCatalogue.h"
#include "SiblingTestSupport.h"
#include "TestFiles.h"

using namespace NSWeather;

namespace
{

class CityCatalogueTest : public SiblingTest::SiblingFixture
{
};

struct PrefixCase
{
    const char* prefix;
    const char* firstId;  // nullptr: nothing matches
};

// Case folding beyond ASCII, the plain-letter form of accented names, and
// the largest city first among several matches.
const PrefixCase PREFIX_CASES[] = {
    {"seoul", "kr-seoul"},      {"SEO", "kr-seoul"},       {"KØBENH", "dk-kobenhavn"},
    {"kobenh", "dk-kobenhavn"}, {"MONTRÉ", "ca-montreal"}, {"montre", "ca-montreal"},
    {"lon", "gb-london"},       {"zzqx", nullptr},         {"", nullptr},
};

TEST_F(CityCatalogueTest, BuiltCatalogueHoldsThousandsLargestFirst)
{
    ASSERT_GE(mCataloguePtr->GetSize(), 2000u);
    CatalogueCityPtr tokyoPtr = mCataloguePtr->FindById("jp-tokyo");
    ASSERT_TRUE(tokyoPtr);
    EXPECT_EQ("Asia/Tokyo", tokyoPtr->GetTimeZone());
    EXPECT_NEAR(35.7, tokyoPtr->GetLatitude(), 0.1);
    EXPECT_FALSE(mCataloguePtr->FindById("nowhere"));
    std::string licence =
        WeatherTest::ReadText(mRoot.Path("apps/com.quorvex.weather-m/shared/res/catalogue/LICENSE"));
    EXPECT_NE(std::string::npos, licence.find("city-timezones")) << licence;
}

TEST_F(CityCatalogueTest, PrefixLookupFoldsCase)
{
    for (const PrefixCase& c : PREFIX_CASES)
    {
        CatalogueCityPtrVector found = mCataloguePtr->FindByPrefix(c.prefix, 5);
        if (!c.firstId)
        {
            EXPECT_TRUE(found.empty()) << c.prefix;
            continue;
        }
        ASSERT_FALSE(found.empty()) << c.prefix;
        EXPECT_EQ(c.firstId, found.front()->GetId()) << c.prefix;
        EXPECT_LE(found.size(), 5u);
        for (size_t i = 1; i < found.size(); ++i)
            EXPECT_GE(found[i - 1]->GetPopulation(), found[i]->GetPopulation()) << c.prefix;
    }
}

struct NearestCase
{
    double latitude;
    double longitude;
    const char* id;
};

// Across the date line the nearest city lies on the other side.
const NearestCase NEAREST_CASES[] = {
    {37.55, 127.0, "kr-seoul"},
    {48.85, 2.35, "fr-paris"},
    {-33.9, 151.2, "au-sydney"},
    {-18.1, -179.9, "fj-suva"},
};

TEST_F(CityCatalogueTest, NearestCityByGreatCircle)
{
    for (const NearestCase& c : NEAREST_CASES)
    {
        CatalogueCityPtr cityPtr = mCataloguePtr->FindNearest(c.latitude, c.longitude);
        ASSERT_TRUE(cityPtr);
        EXPECT_EQ(c.id, cityPtr->GetId()) << c.latitude << "," << c.longitude;
    }
    EXPECT_NEAR(344.0, CityCatalogue::DistanceKm(51.5074, -0.1278, 48.8566, 2.3522), 3.0);
    EXPECT_FALSE(mCataloguePtr->FindNearest(91.0, 0.0));
    EXPECT_FALSE(mCataloguePtr->FindNearest(std::numeric_limits<double>::quiet_NaN(), 0.0));
}

TEST_F(CityCatalogueTest, MalformedLinesAreSkippedAndMissingFileIsNull)
{
    std::string path = mRoot.Path("cities.tsv");
    WeatherTest::WriteText(path,
                           "# header\n"
                           "aa-one\tOne\tOne\tLand\tAA\tP\t10.0\t20.0\tUTC\t100\n"
                           "aa-two\tTwo\tTwo\tLand\tAA\tP\t95.0\t20.0\tUTC\t90\n"  // latitude off the globe
                           "aa-x:C\tBad\tBad\tLand\tAA\tP\t1.0\t2.0\tUTC\t80\n"    // id with a colon
                           "aa-three\tThree\tThree\tLand\tAA\tP\tx\t20.0\tUTC\t70\n"  // not a number
                           "aa-one\tAgain\tAgain\tLand\tAA\tP\t1.0\t2.0\tUTC\t60\n"   // same id again
                           "aa-four\tFour\tFour\tLand\tAA\tP\t1.0\t2.0\tUTC\n");      // field missing
    CityCataloguePtr cataloguePtr = CityCatalogue::Load(path);
    ASSERT_TRUE(cataloguePtr);
    EXPECT_EQ(1u, cataloguePtr->GetSize());
    EXPECT_EQ(5, mLog.Count("skipped")) << mLog.Dump();
    EXPECT_FALSE(CityCatalogue::Load(mRoot.Path("missing.tsv")));
    WeatherTest::WriteText(path, "# only a header\n");
    EXPECT_FALSE(CityCatalogue::Load(path));
}

}  // namespace
