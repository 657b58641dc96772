#!/bin/sh
# Stands in for xdg-email in tests: records its arguments, NUL-separated.
printf '%s\0' "$@" > "${HB_MAIL_RECORD:?}"
exit "${HB_MAIL_EXIT:-0}"
