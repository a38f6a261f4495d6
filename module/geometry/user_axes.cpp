#include "module/geometry/user_axes.h"

#include "module/host_calls/sys_var.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"

UserAxes UserAxes::turned(double angle) const {
    UserAxes result = *this;
    result.x.rotateBy(angle, normal);
    result.y.rotateBy(angle, normal);
    return result;
}

bool worksOnPaper() {
    return CTzadSysVar::GetInt(L"TILEMODE") == 0 && CTzadSysVar::GetInt(L"CVPORT") == 1;
}

UserAxes activeUserAxes() {
    TzDbDatabase const* database = tzdbHostApplicationServices()->workingDatabase();
    UserAxes axes;
    if (worksOnPaper()) {
        axes.x = database->pucsxdir();
        axes.y = database->pucsydir();
    } else {
        axes.x = database->ucsxdir();
        axes.y = database->ucsydir();
    }
    axes.normal = axes.x.crossProduct(axes.y);
    return axes;
}
