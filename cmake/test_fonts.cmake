# Tests see these faces and no others, so that widths and charsets are the same on every machine:
# - DejaVu: wide coverage (Latin, Greek, Cyrillic and more), serif, mono and a bold;
# - Liberation Sans: a second Latin family of other widths, with true bold and italic cuts;
# - Droid Sans Fallback: one small file with the Chinese, Japanese and Korean characters;
# - Noto Sans Hebrew, Arabic, Thai and Armenian: faces that hold one script and no Latin letters;
# - Noto Sans Yi: a face with marks of Chinese, such as the comma, and none of its letters.
# The files are linked into a folder of the build tree, which a fontconfig file of its own names.
set(TZ_TEST_FONTS
    dejavu/DejaVuSans.ttf
    dejavu/DejaVuSans-Bold.ttf
    dejavu/DejaVuSansMono.ttf
    dejavu/DejaVuSerif.ttf
    liberation/LiberationSans-Regular.ttf
    liberation/LiberationSans-Bold.ttf
    liberation/LiberationSans-Italic.ttf
    liberation/LiberationSans-BoldItalic.ttf
    droid/DroidSansFallbackFull.ttf
    noto/NotoSansArabic-Regular.ttf
    noto/NotoSansArmenian-Regular.ttf
    noto/NotoSansHebrew-Regular.ttf
    noto/NotoSansThai-Regular.ttf
    noto/NotoSansYi-Regular.ttf)
set(TZ_TEST_FONTS_CONF ${CMAKE_BINARY_DIR}/tests/fonts/fonts.conf)
file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/tests/fonts/files)
foreach(font IN LISTS TZ_TEST_FONTS)
    if(NOT EXISTS /usr/share/fonts/truetype/${font})
        message(WARNING "Test font ${font} is missing: scripts/setup.sh installs it")
    endif()
    get_filename_component(file ${font} NAME)
    file(CREATE_LINK /usr/share/fonts/truetype/${font} ${CMAKE_BINARY_DIR}/tests/fonts/files/${file}
        SYMBOLIC)
endforeach()
configure_file(${PROJECT_SOURCE_DIR}/tests/fonts/fonts.conf.in ${TZ_TEST_FONTS_CONF} @ONLY)
