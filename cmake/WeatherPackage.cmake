# The Debian package of the suite: `cpack -G DEB` in a build tree makes it
# from the install rules (stripped, run-time dependencies from
# dpkg-shlibdeps).
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME ${PROJECT_NAME})
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_CONTACT "Weather widget team <weather-widget@quorvex.invalid>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "home-screen weather widget with its agent, app and platform stand-in")
set(CPACK_PACKAGE_DESCRIPTION
    "The weather widget com.quorvex.weather-m-widget with stand-ins for its\n"
    "weather agent and weather app, the platform layer and tools it runs on\n"
    "(widget host, widgetctl, vconftool, msgport-send, platform-setup), its\n"
    "resources and catalogues. weather-demo shows it on sample weather.")
string(JOIN "" CPACK_PACKAGE_DESCRIPTION ${CPACK_PACKAGE_DESCRIPTION})
set(CPACK_STRIP_FILES ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION misc)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
# The Korean texts need a font with Hangul.
set(CPACK_DEBIAN_PACKAGE_DEPENDS "fonts-nanum")
include(CPack)
