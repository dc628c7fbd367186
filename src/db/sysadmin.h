#pragma once

#include "db/connection.h"

namespace brasel::db {

// Whether the login of an open connection administers its server: on the embedded engine the
// sysadmin flag of its master.sqlite login; on PostgreSQL a superuser or a role that may create
// databases and roles.
bool loginSysAdmin(Connection& conn);

}  // namespace brasel::db
