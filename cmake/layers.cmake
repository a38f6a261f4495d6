# Which folder may include which: the one table of the dependency graph. CMake gives every target
# only the include roots of its row, and the test `lint.layers` reads every #include against it.
#
#   tz_row(FOLDER [USES folders...] [LIBRARIES third-party libraries...])
#
# Rows stand bottom to top, so a folder may only use folders of rows above its own line here: no
# cycles. A row also names what its folder reaches only through others: those headers must be found,
# and a suite that links a layer links the layers of its row. Each row is one line, since the lint
# reads this file too. Folders with no LIBRARIES column under sdk/, module/ and examples/ use the
# standard library alone (and the smallest host the loader).
#
# Names of libraries: json (nlohmann-json), fastjson (RapidJSON), ini (SimpleIni), fontconfig,
# pango (with GLib), cairo, boxes (Boost.Geometry), cli (CLI11), editline (libedit).

tz_row(sdk)

# module/globals has no header of its own: sdk/tz/mte/globals.h declares what it defines.
tz_row(module/globals      USES sdk)
tz_row(module/holders      USES sdk)
tz_row(module/host_calls   USES sdk)
tz_row(module/texts        USES sdk module/host_calls)
tz_row(module/geometry     USES sdk module/host_calls)
tz_row(module/styles       USES sdk module/host_calls module/texts)
tz_row(module/uncalled     USES sdk module/host_calls module/texts)
tz_row(module/fonts        USES sdk module/globals module/host_calls module/texts)
tz_row(module/prompt       USES sdk module/globals module/host_calls module/texts)
tz_row(module/markup/shared       USES sdk module/host_calls module/fonts)
tz_row(module/markup/read_markup  USES sdk module/globals module/markup/shared)
tz_row(module/markup/write_rtf    USES sdk module/globals module/host_calls module/styles module/fonts module/markup/shared module/markup/read_markup)
tz_row(module/markup/read_rtf     USES sdk module/markup/shared)
tz_row(module/markup/write_markup USES sdk module/globals module/texts module/fonts module/markup/shared module/markup/read_rtf)
tz_row(module/markup/session      USES sdk module/globals module/host_calls module/texts module/styles module/fonts module/markup/shared module/markup/read_markup module/markup/write_rtf module/markup/read_rtf module/markup/write_markup)
# module/editor_state has no header of its own: it defines what sdk/tz/mte declares for dialogs.
tz_row(module/editor_state USES sdk module/globals module/host_calls module/texts module/styles module/fonts module/markup/shared module/markup/read_markup module/markup/write_rtf module/markup/read_rtf module/markup/write_markup module/markup/session)
tz_row(module/edit         USES sdk module/globals module/holders module/host_calls module/texts module/geometry module/styles module/fonts module/markup/shared module/editor_state)
tz_row(module/mtext        USES sdk module/globals module/holders module/host_calls module/texts module/geometry module/styles module/prompt module/edit)
tz_row(module/commands     USES sdk module/globals module/holders module/host_calls module/texts module/styles module/prompt module/edit)
tz_row(module/align/spacing USES sdk module/globals module/holders module/host_calls module/texts module/geometry)
tz_row(module/align        USES sdk module/globals module/holders module/host_calls module/texts module/geometry module/align/spacing)
tz_row(module/shell        USES sdk module/globals module/holders module/host_calls module/texts module/geometry module/styles module/fonts module/prompt module/markup/shared module/markup/read_markup module/markup/write_rtf module/markup/read_rtf module/markup/write_markup module/markup/session module/editor_state module/edit module/mtext module/commands module/align/spacing module/align)

tz_row(host/base           USES sdk LIBRARIES json)
tz_row(host/geometry       USES sdk)
tz_row(host/text           USES sdk)
tz_row(host/page           USES sdk host/text)
tz_row(host/files          USES sdk host/base host/text LIBRARIES json fastjson ini)
tz_row(host/settings       USES sdk host/base host/text host/files LIBRARIES json)
tz_row(host/code_pages     USES sdk host/settings)
tz_row(host/fonts          USES sdk host/base host/text host/files host/code_pages LIBRARIES fontconfig)
tz_row(host/rtf            USES sdk host/text host/code_pages)
tz_row(host/resources      USES sdk host/base host/text host/files)
tz_row(host/platform       USES sdk host/base host/text LIBRARIES json)
tz_row(host/faults         USES sdk host/base host/text)
tz_row(host/runtime        USES sdk host/base host/text host/settings host/faults LIBRARIES json)
tz_row(host/shaping        USES sdk host/text LIBRARIES pango cairo)
tz_row(host/layout         USES sdk host/text host/shaping LIBRARIES fontconfig)
tz_row(host/database       USES sdk host/base host/text host/page host/settings host/runtime LIBRARIES json)
tz_row(host/fields         USES sdk host/base host/text host/page host/settings host/platform host/runtime host/database)
tz_row(host/entities       USES sdk host/base host/text host/page host/settings host/shaping host/layout host/database host/fields)
tz_row(host/drawing_file   USES sdk host/base host/text host/page host/files host/settings host/runtime host/shaping host/layout host/database host/fields host/entities)
tz_row(host/display        USES sdk host/base host/text host/page host/files host/settings host/platform host/runtime host/shaping host/layout host/database LIBRARIES json pango cairo)
tz_row(host/command_line   USES sdk host/base host/text host/page host/settings host/platform host/runtime host/shaping host/layout host/database host/display LIBRARIES json editline)
tz_row(host/selection      USES sdk host/base host/text host/page host/settings host/platform host/runtime host/shaping host/layout host/database host/display host/command_line LIBRARIES json boxes)
tz_row(host/editors        USES sdk host/base host/text host/files host/settings host/code_pages host/rtf host/platform host/runtime host/command_line LIBRARIES json)

tz_row(apps/options        USES sdk host/text host/files host/resources LIBRARIES json cli)
tz_row(apps/tzdraft        USES sdk apps/options host/base host/text host/page host/files host/settings host/fonts host/resources host/platform host/faults host/runtime host/shaping host/layout host/database host/drawing_file host/display host/command_line host/selection host/editors LIBRARIES json cli editline)
tz_row(apps/tzconvert      USES sdk apps/options host/base host/text host/files host/settings host/code_pages host/fonts host/rtf host/resources module/globals module/host_calls module/texts module/styles module/fonts module/markup/shared module/markup/read_markup module/markup/write_rtf module/markup/read_rtf module/markup/write_markup module/markup/session LIBRARIES json cli)

tz_row(examples            USES sdk)
