// SPDX-License-Identifier: MIT
import QtQuick 2.15

Item {}
