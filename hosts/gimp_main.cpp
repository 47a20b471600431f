// orvela-gimp: the filter as a plug-in of GIMP 2.10, which starts it.

#include "gimp/DrawableArea.h"
#include "gimp/PictureWork.h"
#include "run/UsageError.h"

#include <libgimp/gimp.h>

#include <array>

namespace {

using namespace orvela;

constexpr char kProcedure[] = "plug-in-orvela";
constexpr int kMostArguments = 6;

constexpr char kHelp[] = "Interactively the windows of Orvela open over what is selected of the drawable. "
                         "With the last values what "
                         "was last accepted in them is done again, without windows. Otherwise the settings "
                         "count that are given: a "
                         "mode, settings by name and a preset, as `orvela enhance` takes them; `orvela "
                         "modes` lists all. Soft edges "
                         "of the selection are blended, transparency stays as it is.";

void query() {
    static const std::array<GimpParamDef, kMostArguments> arguments{{
        {GIMP_PDB_INT32, const_cast<gchar*>("run-mode"),
         const_cast<gchar*>("The run mode { RUN-INTERACTIVE (0), RUN-NONINTERACTIVE (1), "
                            "RUN-WITH-LAST-VALS (2) }")},
        {GIMP_PDB_IMAGE, const_cast<gchar*>("image"), const_cast<gchar*>("Input image")},
        {GIMP_PDB_DRAWABLE, const_cast<gchar*>("drawable"), const_cast<gchar*>("Input drawable")},
        {GIMP_PDB_STRING, const_cast<gchar*>("mode"),
         const_cast<gchar*>("Name of the mode; empty: Automatic, or Advanced with a preset")},
        {GIMP_PDB_STRING, const_cast<gchar*>("settings"),
         const_cast<gchar*>("Settings NAME=POSITION,on with blanks between them; empty: none")},
        {GIMP_PDB_STRING, const_cast<gchar*>("preset"),
         const_cast<gchar*>("Preset file, or name of a stored preset; empty: none")},
    }};
    gimp_install_procedure(kProcedure, "Enhance a photograph: light, contrast, colour, texture and noise",
                           kHelp, "Kestrand", "Kestrand", "2026", "_Orvela…", "RGB*, GRAY*", GIMP_PLUGIN,
                           kMostArguments, 0, arguments.data(), nullptr);
    gimp_plugin_menu_register(kProcedure, "<Image>/Filters/_Kestrand");
}

std::string textOf(const GimpParam& argument) {
    return argument.data.d_string != nullptr ? argument.data.d_string : "";
}

PictureWork workFor(GimpRunMode mode, const GimpParam* arguments, int count) {
    switch (mode) {
    case GIMP_RUN_INTERACTIVE:
        return workByWindows(static_cast<std::uint64_t>(gimp_progress_get_window_handle()));
    case GIMP_RUN_WITH_LAST_VALS:
        return workByLastSettings();
    default:
        if (count != kMostArguments)
            throw UsageError("run mode, image, drawable, mode, settings and preset are needed");
        return workBySettings({textOf(arguments[3]), textOf(arguments[4]), textOf(arguments[5])});
    }
}

void tellProgress(double fraction, const std::string& step) {
    gimp_progress_set_text(step.c_str());
    gimp_progress_update(fraction);
}

GimpPDBStatusType filter(const GimpParam* arguments, int count) {
    gegl_init(nullptr, nullptr);
    gimp_progress_init("Orvela");
    const DrawableArea area(arguments[2].data.d_drawable);
    const auto mode = static_cast<GimpRunMode>(arguments[0].data.d_int32);
    const PictureWork work = workFor(mode, arguments, count);
    for (const std::string& note : work.notes)
        gimp_message(note.c_str());
    area.check(work.needs);
    const std::optional<Photograph> result = work.run(area.read(), tellProgress);
    if (!result)
        return GIMP_PDB_CANCEL;
    area.write(*result);
    if (mode != GIMP_RUN_NONINTERACTIVE) // a script decides by itself when its steps are to be seen
        gimp_displays_flush();
    gimp_progress_end();
    return GIMP_PDB_SUCCESS;
}

// GIMP shows the text to the user.
void run(const gchar* /*procedure*/, gint count, const GimpParam* arguments, gint* returned,
         GimpParam** values) {
    static std::array<GimpParam, 2> answer{};
    static std::string text;
    GimpPDBStatusType status = GIMP_PDB_EXECUTION_ERROR;
    text.clear();
    try {
        status = filter(arguments, count);
    } catch (const UsageError& error) {
        status = GIMP_PDB_CALLING_ERROR;
        text = error.what();
    } catch (const std::exception& error) {
        text = failureText(error);
    } catch (...) {
        text = "failed for an unknown reason; please report this";
    }
    answer[0].type = GIMP_PDB_STATUS;
    answer[0].data.d_status = status;
    answer[1].type = GIMP_PDB_STRING;
    answer[1].data.d_string = text.data();
    *returned = text.empty() ? 1 : 2;
    *values = answer.data();
}

constexpr GimpPlugInInfo kPlugIn{nullptr, nullptr, query, run};

} // namespace

int main(int argc, char** argv) {
    return gimp_main(&kPlugIn, argc, argv);
}
