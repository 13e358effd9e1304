# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

# The one place that says which version this is: MAJOR.MINOR.PATCH, by the rules of semantic versions.
set(OLVANE_VERSION 0.1.0)
