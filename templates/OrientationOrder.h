#pragma once

/// Order of the northing and easting columns.
enum ORIENTATION_ORDER : int
{
    ORDER_EASTING_NORTHING = 0,
    ORDER_NORTHING_EASTING = 1
};
