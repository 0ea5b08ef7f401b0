#include "tests/gui/gui_test.h"

#include "resources/image_data.h"
#include "resources/images.h"

#include <wx/image.h>

#include <algorithm>
#include <iterator>
#include <set>
#include <tuple>

namespace
{

// Compares a bitmap with the pixels it was made from: the mask colour must have become
// transparent, every other pixel opaque and unchanged, and the picture must not be blank.
void ExpectPicture(const wxBitmap& bitmap, const unsigned char* pixels, int size)
{
    ASSERT_TRUE(bitmap.IsOk());
    ASSERT_EQ(bitmap.GetSize(), wxSize(size, size));
    ASSERT_NE(bitmap.GetMask(), nullptr);
    const wxImage image = bitmap.ConvertToImage();
    ASSERT_TRUE(image.HasMask());
    int opaque = 0;
    std::set<std::tuple<int, int, int>> colours;
    for (int y = 0; y < size; ++y)
        for (int x = 0; x < size; ++x)
        {
            const unsigned char* p = pixels + 3 * (y * size + x);
            const bool background = p[0] == 236 && p[1] == 233 && p[2] == 216;
            ASSERT_EQ(image.IsTransparent(x, y), background) << x << "," << y;
            if (background)
                continue;
            ++opaque;
            colours.emplace(p[0], p[1], p[2]);
            ASSERT_EQ(image.GetRed(x, y), p[0]) << x << "," << y;
            ASSERT_EQ(image.GetGreen(x, y), p[1]) << x << "," << y;
            ASSERT_EQ(image.GetBlue(x, y), p[2]) << x << "," << y;
        }
    EXPECT_LT(opaque, size * size); // something shows the background through
    EXPECT_GT(opaque, size * size / 5);
    EXPECT_GE(colours.size(), 4u);
}

} // namespace

TEST(Images, ToolPicturesAreMasked24PixelImages)
{
    for (int i = 0; i < COMMAND_BAR_IMAGE_COUNT; ++i)
    {
        SCOPED_TRACE(i);
        ExpectPicture(CommandBarBitmap(i), COMMAND_BAR_PIXELS[i], 24);
    }
    SCOPED_TRACE("logo");
    ExpectPicture(LogoBitmap(0), LOGO_PIXELS, 32);
}

TEST(Images, IndexesOutOfRangeGiveTheNullBitmap)
{
    for (int i : {-1, COMMAND_BAR_IMAGE_COUNT, 100})
        EXPECT_FALSE(CommandBarBitmap(i).IsOk()) << i;
    for (int i : {-1, 1})
        EXPECT_FALSE(LogoBitmap(i).IsOk()) << i;
}

TEST(Images, NoTwoToolsShareAPicture)
{
    for (int i = 0; i < COMMAND_BAR_IMAGE_COUNT; ++i)
        for (int j = i + 1; j < COMMAND_BAR_IMAGE_COUNT; ++j)
            EXPECT_FALSE(std::equal(std::begin(COMMAND_BAR_PIXELS[i]),
                                    std::end(COMMAND_BAR_PIXELS[i]), COMMAND_BAR_PIXELS[j]))
                << i << " " << j;
}

TEST(Images, WindowIconComesInThreeSizes)
{
    const wxIconBundle icons = AppIcons();
    EXPECT_EQ(icons.GetIconCount(), 3u);
    for (int size : {16, 32, 48})
    {
        SCOPED_TRACE(size);
        const wxIcon icon = icons.GetIcon(wxSize(size, size), wxIconBundle::FALLBACK_NONE);
        ASSERT_TRUE(icon.IsOk());
        EXPECT_EQ(icon.GetSize(), wxSize(size, size));
        const wxImage image = icon.ConvertToImage();
        EXPECT_TRUE(image.IsTransparent(0, 0));
        EXPECT_FALSE(image.IsTransparent(size / 2, size / 2));
    }
}
