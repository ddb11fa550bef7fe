// SPDX-License-Identifier: MIT
import QtQml 2.15

QtObject {}
