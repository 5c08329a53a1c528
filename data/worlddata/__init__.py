"""Builds the city database and the texts of cities and countries from installed packages."""
