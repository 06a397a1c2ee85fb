"""What the classes of the sections tell of each keyword, from the tables and pages of the model."""

import inspect

import pytest

import gridbay_setup
from gridbay_setup import _sections
from gridbay_setup.model import Model


def all_keywords(section=Model, path=""):
    for name, field in section.fields().items():
        if isinstance(field, _sections.Keyword):
            yield path + name, field
        else:
            yield from all_keywords(field.kind, f"{path}{name}.")


KEYWORDS = dict(all_keywords())


def described(keyword):
    """The keyword, or its values where they differ."""
    return keyword.parts or (keyword,)


# Those that no page has a control for, but for the map projection, which needs a grid, and the definition of the
# ecological model, which is chosen in a dialog alone.
NO_CONTROL = {
    "bio_rig.model_definition.model_definition_file",
    "hydrodynamic.open_boundary.boundaries.relaxation_factor",
    "hydrodynamic.structure_module.crosssections.cross_section_data_bridge",
    "hydrodynamic.structure_module.crosssections.cross_section_file",
    "hydrodynamic.structure_module.culverts.culvert_data.horiz_offset",
    "hydrodynamic.structure_module.structure_version",
    "hydrodynamic.structure_module.weir.weir_data.horiz_offset",
    "hydrodynamic.structure_module.weir.weir_data.weir_formula3_param",
    "mud_transport_expanded.forcing_functions.wave_data.shearstress_formulation",
    "nested_model_globals.bathymetry_selection.projection",
    "nested_model_globals.source_and_sink.source_sinks.sink_area",
    "nested_model_globals.source_and_sink.source_sinks.source_area",
}
# Files of maps behind more choices than are tried at once.
_EACH_LAYER = "mud_transport.mt_parameters.erosion_characteristics_for_each_layer"
NOT_FOUND = {
    f"{section}.{name}"
    for section in ("advection_dispersion.heat_dissipation.components",
                    "mud_transport_expanded.bed_parameters.transition_of_mud_between_layers.layers.areas",
                    f"{_EACH_LAYER}.erosion_coefficient_factor1.layers.areas",
                    f"{_EACH_LAYER}.erosion_coefficient_factor2.layers.areas")
    for name in ("file_name", "item_numbers")
}  # fmt: skip


def test_what_a_control_edits_has_its_label_and_page():
    unknown = {path for path, keyword in KEYWORDS.items() if not any(part.label for part in described(keyword))}
    settable = {path for path in unknown if KEYWORDS[path].settable}
    assert settable - NO_CONTROL - NOT_FOUND == set()
    assert NO_CONTROL <= unknown
    assert all(keyword.page for path, keyword in KEYWORDS.items() if path not in unknown)


def test_counts():
    assert len(KEYWORDS) >= 870
    assert sum(any(part.label for part in described(keyword)) for keyword in KEYWORDS.values()) >= 830
    assert sum(any(part.unit for part in described(keyword)) for keyword in KEYWORDS.values()) >= 165
    assert sum(any(part.choices for part in described(keyword)) for keyword in KEYWORDS.values()) >= 175
    assert sum(bool(keyword.default) for keyword in KEYWORDS.values()) >= 750


def test_every_quantity_has_its_unit_in_the_docstring():
    for path, keyword in KEYWORDS.items():
        for part in described(keyword):
            assert bool(part.unit) == bool(part.quantity), path
            if part.unit:
                assert f"{part.quantity} ({part.unit})" in keyword.__doc__, path
        assert f"{keyword.default or 'empty'} in a new setup" in keyword.__doc__, path


@pytest.mark.parametrize("path, unit, default, label", [
    ("nested_model_globals.flood_and_dry.drying_depth",
     "m", "0.02", "Drying depth"),
    ("nested_model_globals.flood_and_dry.flooding_depth",
     "m", "0.05", "Flooding depth"),
    ("nested_model_globals.simulation_period.time_step_interval",
     "s", "30.0", "Time step interval"),
    ("hydrodynamic.eddy_viscosity.areas.constant_value",
     "m²/s", "0.0", "Viscosity"),
    ("hydrodynamic.open_boundary.boundaries.value",
     "m", "0.0", "Boundary conditions"),
    ("hydrodynamic.open_boundary.boundaries.sinusoidal_boundary.range",
     "m", "1.0", "Edit Sine Series Boundary Parameters: Range"),
    ("hydrodynamic.output_specification.inundation_statistics.threshold_height",
     "m", "0.0", "Threshold depth"),
    ("hydrodynamic.resistance.areas.constant_value",
     "m^⅓/s", "32.0", "Constant"),
    ("hydrodynamic.resistance.sediment_data.constant_grain_size",
     "mm", "0.2", "Effective diameter"),
    ("hydrodynamic.resistance.update_frequency",
     "-", "1", "Update frequency"),
    ("hydrodynamic.source_and_sink.precipitation",
     "mm/d", "0.0", "Value"),
    ("hydrodynamic.source_and_sink.evaporation",
     "mm/d", "0.0", "Value"),
    ("hydrodynamic.source_and_sink.source_sinks.constant_magnitude",
     "m³/s", "0.0", "Magnitude"),
    ("hydrodynamic.source_and_sink.source_sinks.constant_velocity",
     "m/s", "0.0", "Velocity"),
    ("hydrodynamic.source_and_sink.source_sinks.outlet_dir",
     "°", "0.0", "Outlet Dir."),
    ("hydrodynamic.structures.dikes.dikes.coefficient",
     "m^½/s", "1.838", "Discharge Coef"),
    ("hydrodynamic.structures.dikes.dikes.points.x",
     "m", "0.0", "Easting"),
    ("hydrodynamic.structures.dikes.dikes.points.z",
     "m", "0.0", "Z"),
    ("hydrodynamic.structure_module.culverts.culvert_data.geometry.cicular_diameter",
     "m", "1.0", "Circular, Diameter"),
    ("hydrodynamic.structure_module.weir.weir_data.delhs",
     "m", "0.01", "Alpha zero"),
    ("hydrodynamic.structure_module.weir.weir_data.x",
     "m", "", "Point Selection: X"),
    ("hydrodynamic.surface_elevation.areas.constant_value",
     "m", "0.0", "Value"),
    ("hydrodynamic.wind_conditions.constant_wind_direction",
     "°", "270.0", "Direction"),
    ("hydrodynamic.wind_conditions.neutral_pressure",
     "hPa", "1013.0", "Neutral pressure"),
    ("hydrodynamic.waves.constant_wave_period",
     "s", "3.0", "Wave period"),
    ("advection_dispersion.boundary_concentrations.boundaries.constant_value_1",
     "mg/l", "0.0", "Constant concentrations"),
    ("advection_dispersion.decay_coefficients.components.constant_value",
     "/d", "0.0", "Value"),
    ("advection_dispersion.deposition_concentrations.soil_deposition.components.areas.constant_value",
     "g/m²/d", "0.0", "Value"),
    ("advection_dispersion.dispersion_conditions.max_dispersion_coefficient",
     "m²/s", "0.0", "Max. value"),
    ("advection_dispersion.heat_dissipation.components.constant_value",
     "°C", "0.0", "Value"),
    ("advection_dispersion.heat_exchange.air_constant_value",
     "°C", "20.0", "Value"),
    ("advection_dispersion.ad_feed_back_on_hd_calculations.constant_salinity",
     "PSU", "7.0", "Constant"),
    ("bio_rig.ad_transport_parameters.ad_dispersion.min_dispersion_coefficient",
     "m²/s", "0.0", "Min. value"),
    ("mud_transport.dispersion_conditions.proportionality_factor_xdir",
     "m²/s", "1.0", "Proportionality factor in x- direction"),
    ("mud_transport.forcing_functions.bed_roughness.constant_value",
     "m", "0.001", "Bed roughness"),
    ("mud_transport.initial_concentrations.bed_thickness.layers.constant_value",
     "m", "0.0", "Value"),
    ("mud_transport.mt_parameters.erosion_characteristics_for_each_layer.density_of_bed_material.layers.constant_value",
     "g/m³", "150000.0", "Value"),
    ("mud_transport.mt_parameters.erosion_characteristics_for_each_layer.erosion_coefficient_factor.layers.constant_value",
     "g/m²/s", "0.05", "Value"),
    ("mud_transport.mt_parameters.settling_and_deposition.components.mean_settling_velocity",
     "m/s", "0.0005", "Mean settling velocity"),
    ("mud_transport.sliding.variable_sliding_coefficient.solid_density",
     "kg/m³", "2650.0", "Solid density"),
    ("mud_transport_expanded.bed_parameters.critical_shear_stress_erosion.bed_layers.areas.constant_value",
     "N/m²", "0.1", "Value"),
    ("mud_transport_expanded.bed_parameters.erosion_coefficients.bed_layers.areas.constant_value",
     "kg/m²/s", "5e-05", "Value"),
    ("mud_transport_expanded.initial_concentrations.salinity.areas.constant_value",
     "PSU", "40.0", "Value"),
    ("mud_transport_expanded.forcing_functions.wave_data.wave_database_parameters.wind_direction.increment_value_of_wind_direction",
     "°", "90.0", "Increment"),
    ("mud_transport_expanded.watercoloumn_parameters.fall_velocity_parameters.rho_sed",
     "kg/m³", "2650.0", "RhoSed"),
    ("hydrodynamic.wind_conditions.constant_friction", "", "0.0026", "Constant"),
    ("advection_dispersion.component_specifications.no_of_components", "", "1", "Number of Components"),
    ("nested_model_globals.simulation_period.number_of_timesteps", "", "100", "Last"),
    ("hydrodynamic.wind_conditions.file_name", "", "", "Data file"),
    ("bio_rig.model_definition.update_frequency", "", "1", "Update Frequency"),
])  # fmt: skip
def test_keywords_of_all_modules(path, unit, default, label):
    keyword = KEYWORDS[path]
    assert (keyword.unit, keyword.default, keyword.label) == (unit, default, label)


@pytest.mark.parametrize("path, parts", [
    ("hydrodynamic.structure_module.culverts.culvert_data.geometry.rectangular",
     [("m", "Rectangular, Width"), ("m", "Rectangular, Height")]),
    ("hydrodynamic.structure_module.weir.weir_data.weir_formula2_param",
     [("m", "Weir formula 2 (Honma), Width"), ("m", "Weir formula 2 (Honma), Crest level"),
      ("m^½/s", "Weir formula 2 (Honma), Weir coeff.")]),
    ("hydrodynamic.structure_module.weir.weir_data.geometry.attributes",
     [("", ""), ("m", "Broad crested weir, Datum")]),
])  # fmt: skip
def test_each_of_several_values_has_its_own(path, parts):
    keyword = KEYWORDS[path]
    assert [(part.unit, part.label) for part in keyword.parts] == parts
    for number, (unit, label) in enumerate(parts, 1):
        line = next(line for line in keyword.__doc__.splitlines() if line.strip().startswith(f"value {number}:"))
        assert label in line and (label or "no control" in line) and (not unit or f"({unit})" in line)


def test_choices_tell_what_a_value_means():
    assert KEYWORDS["nested_model_globals.source_and_sink.source_sinks.type"].choices == {
        "0": "Isolated Source", "1": "Isolated Sink", "2": "Source and Sink pair"}  # fmt: skip
    flag = KEYWORDS["nested_model_globals.flood_and_dry.enable_flood_and_dry_checking"]
    assert flag.choices == {"0": "off", "1": "on"}
    assert KEYWORDS["mud_transport.task_selection.multifraction"].choices["false"] == "Multi layer"


@pytest.mark.parametrize("name", ["CClimateChange_V27", "Flooding_V27FlowModel", "OutputPosition",
                                  "UrbanFlooding_V27Flowmodel", "Flooding_V27WSKFlowModel"])  # fmt: skip
def test_every_member_of_the_exported_classes_says_what_it_does(name):
    kind = getattr(gridbay_setup, name)
    for member, value in vars(kind).items():
        if member.startswith("_"):
            continue
        # The first line is how it is called.
        text = inspect.getdoc(value) or ""
        assert text.splitlines()[2 if "->" in text.splitlines()[0] else 0 :], member
    assert kind.__doc__


def test_units_of_the_forcings():
    kind = gridbay_setup.CClimateChange_V27
    assert "precipitation, mm per day" in kind.GetPrecValues.__doc__
    assert "evaporation, mm per day" in kind.SetEvapValues.__doc__
    assert "air temperature, degrees Celsius" in kind.SetTempValues.__doc__
    assert "water level" in kind.GetWLValue.__doc__ and ", m." in kind.SetWLValue.__doc__
