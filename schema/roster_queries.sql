-- Stored queries over rosters.

CREATE VIEW [Qry_roster_load_project] AS
SELECT [roster_project_id], [roster_project], [position], [active_in_view]
FROM [tbl_roster_project]
ORDER BY [position], [roster_project_id];

-- Duties with their settings, project by project.
CREATE VIEW [qry_roster_duty_load] AS
SELECT y.[duty_id], y.[roster_project_id], y.[duty], y.[position], y.[master_duty_id], y.[max_people], y.[max_team],
    y.[Frequency], y.[frequency_start], y.[pattern_pos], y.[one], y.[two], y.[three], y.[four], y.[five], y.[p_day],
    y.[Sunday], y.[Monday], y.[Tuesday], y.[Wednesday], y.[Thursday], y.[Friday], y.[Saturday], j.[roster_project],
    j.[position] AS [project_position], m.[master_duty]
FROM [tbl_roster_duty] y
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
LEFT JOIN [tbl_roster_master_duty] m ON m.[master_duty_id] = y.[master_duty_id]
ORDER BY j.[position], y.[position], y.[duty_id];

-- The columns of the roster grid.
CREATE VIEW [qry_roster_display_duty] AS
SELECT y.[duty_id], y.[roster_project_id], y.[duty], y.[position], y.[master_duty_id], m.[master_duty],
    m.[position] AS [master_position], y.[max_people], y.[max_team], j.[roster_project],
    j.[position] AS [project_position], j.[active_in_view]
FROM [tbl_roster_duty] y
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
LEFT JOIN [tbl_roster_master_duty] m ON m.[master_duty_id] = y.[master_duty_id]
ORDER BY j.[position], y.[position], y.[duty_id];

-- Dates, the oldest first.
CREATE VIEW [qry_roster_date_load] AS
SELECT r.[date_id], r.[roster_project_id], r.[date], j.[roster_project]
FROM [tbl_roster_date] r
JOIN [tbl_roster_project] j ON j.[roster_project_id] = r.[roster_project_id]
ORDER BY r.[date], j.[position], r.[date_id];

CREATE VIEW [qry_roster_view_date_load] AS
SELECT r.[date_id], r.[roster_project_id], r.[date], j.[roster_project], j.[position] AS [project_position],
    j.[active_in_view]
FROM [tbl_roster_date] r
JOIN [tbl_roster_project] j ON j.[roster_project_id] = r.[roster_project_id]
ORDER BY r.[date], j.[position], r.[date_id];

-- With how many people each date would lose.
CREATE VIEW [qry_roster_date_rebuild] AS
SELECT r.[date_id], r.[roster_project_id], r.[date],
    (SELECT COUNT(*) FROM [tbl_roster_build] b WHERE b.[date_id] = r.[date_id]) AS [placed]
FROM [tbl_roster_date] r
ORDER BY r.[date], r.[date_id];

CREATE VIEW [qry_roster_date_sort] AS
SELECT [roster_project_id], [date_sort]
FROM [tbl_roster_date_sort]
ORDER BY [date_sort], [roster_project_id];

CREATE VIEW [qry_roster_build_find_date_id] AS
SELECT y.[duty_id], r.[date_id], r.[date], r.[roster_project_id]
FROM [tbl_roster_date] r
JOIN [tbl_roster_duty] y ON y.[roster_project_id] = r.[roster_project_id]
ORDER BY r.[date], r.[date_id];

-- Every date with its note, or with none, the newest first.
CREATE VIEW [Qry_roster_memo] AS
SELECT r.[date_id], r.[roster_project_id], r.[date], m.[Notes]
FROM [tbl_roster_date] r
LEFT JOIN [tbl_roster_memo] m ON m.[date_id] = r.[date_id]
ORDER BY r.[date] DESC, r.[date_id] DESC;

-- The people of a duty, in the orders in which they can be tried. A random order is made after reading.
CREATE VIEW [qry_roster_load_people] AS
SELECT r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family], r.[substitute],
    r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day],
    r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day],
    r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday],
    r.[every_Friday], r.[every_Saturday], r.[people_max], r.[people_priority_frequency], p.[Surname_ID], f.[surname],
    p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY r.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_load_people_A_Z] AS
SELECT r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family], r.[substitute],
    r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day],
    r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day],
    r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday],
    r.[every_Friday], r.[every_Saturday], r.[people_max], r.[people_priority_frequency], p.[Surname_ID], f.[surname],
    p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY p.[sort_key], p.[Name], r.[roster_people_id];

CREATE VIEW [qry_roster_load_people_Z_A] AS
SELECT r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family], r.[substitute],
    r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day],
    r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day],
    r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday],
    r.[every_Friday], r.[every_Saturday], r.[people_max], r.[people_priority_frequency], p.[Surname_ID], f.[surname],
    p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY p.[sort_key] DESC, p.[Name] DESC, r.[roster_people_id] DESC;

CREATE VIEW [qry_roster_load_people_random] AS
SELECT r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family], r.[substitute],
    r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day],
    r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day],
    r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday],
    r.[every_Friday], r.[every_Saturday], r.[people_max], r.[people_priority_frequency], p.[Surname_ID], f.[surname],
    p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id];

-- Only who has a weight, the heaviest first.
CREATE VIEW [qry_roster_build_priotity] AS
SELECT r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family], r.[substitute],
    r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day],
    r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day],
    r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday],
    r.[every_Friday], r.[every_Saturday], r.[people_max], r.[people_priority_frequency], p.[Surname_ID], f.[surname],
    p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
WHERE r.[people_priority_frequency] > 0
ORDER BY r.[people_priority_frequency] DESC, r.[position], r.[roster_people_id];

-- What the setup of a duty lists: its people, and its teams.
CREATE VIEW [qry_roster_duty_setup] AS
SELECT r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family], r.[substitute],
    r.[people_max], r.[people_priority_frequency], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[Condition]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY r.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_duty_setup2] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info],
    (SELECT COUNT(*) FROM [tbl_roster_team_setup] m WHERE m.[team_id] = t.[team_id]) AS [members]
FROM [tbl_roster_team] t
ORDER BY t.[position], t.[team_id];

-- When people can serve: of one to be copied, of a family, of a duty.
CREATE VIEW [qry_roster_availability_copy] AS
SELECT r.[roster_people_id], r.[duty_id], r.[person_id], r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday],
    r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day], r.[absent_1st], r.[absent_2nd], r.[absent_3rd],
    r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day], r.[every_start], r.[every_Sunday],
    r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday], r.[every_Friday],
    r.[every_Saturday], r.[people_max], r.[people_priority_frequency]
FROM [tbl_roster_people] r;

CREATE VIEW [qry_roster_availability_family] AS
SELECT p.[Surname_ID], r.[person_id], p.[Name], p.[position] AS [family_position], r.[roster_people_id], r.[duty_id],
    y.[duty], y.[roster_project_id], j.[roster_project], r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday],
    r.[Thursday], r.[Friday], r.[Saturday], r.[absent_day], r.[absent_1st], r.[absent_2nd], r.[absent_3rd],
    r.[absent_4th], r.[absent_5th], r.[every_week], r.[every_day], r.[every_start], r.[every_Sunday],
    r.[every_Monday], r.[every_Tuesday], r.[every_Wednesday], r.[every_Thursday], r.[every_Friday], r.[every_Saturday]
FROM [tbl_roster_people] r
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
ORDER BY p.[position], j.[position], y.[position];

CREATE VIEW [qry_roster_availability_function] AS
SELECT y.[roster_project_id], j.[roster_project], r.[duty_id], y.[duty], y.[master_duty_id], r.[roster_people_id],
    r.[person_id], r.[position], r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday],
    r.[Saturday], r.[absent_day], r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th],
    r.[every_week], r.[every_day], r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday],
    r.[every_Wednesday], r.[every_Thursday], r.[every_Friday], r.[every_Saturday]
FROM [tbl_roster_people] r
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], r.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_check_status] AS
SELECT r.[roster_people_id], r.[duty_id], r.[person_id], p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name],
    p.[Preferred_Name_hidden], p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact],
    f.[Condition]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID];

-- Dates inside an absence of a person, on whichever duty it was entered.
CREATE VIEW [qry_roster_find_not] AS
SELECT r.[person_id], a.[roster_people_id], r.[duty_id], x.[date_id], x.[roster_project_id], x.[date],
    a.[absent_from], a.[absent_to]
FROM [tbl_roster_absence] a
JOIN [tbl_roster_people] r ON r.[roster_people_id] = a.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date] >= a.[absent_from] AND x.[date] <= a.[absent_to];

-- Dates on which a member keeps a team away.
CREATE VIEW [qry_roster_build_team_availability] AS
SELECT m.[team_id], m.[roster_people_id], n.[person_id], n.[date_id], n.[roster_project_id], n.[date]
FROM [tbl_roster_team_setup] m
JOIN [tbl_roster_people] r ON r.[roster_people_id] = m.[roster_people_id]
JOIN [qry_roster_find_not] n ON n.[person_id] = r.[person_id];

-- The teams of a duty in the same orders.
CREATE VIEW [qry_roster_load_team] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info], y.[roster_project_id]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
ORDER BY t.[position], t.[team_id];

CREATE VIEW [qry_roster_load_team_A_Z] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info], y.[roster_project_id]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
ORDER BY lower(t.[team]), t.[team], t.[team_id];

CREATE VIEW [qry_roster_load_team_Z_A] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info], y.[roster_project_id]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
ORDER BY lower(t.[team]) DESC, t.[team] DESC, t.[team_id] DESC;

CREATE VIEW [qry_roster_load_team_random] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info], y.[roster_project_id]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id];

CREATE VIEW [qry_roster_load_team_priority] AS
SELECT t.[team_id], t.[duty_id], t.[team], t.[position], t.[team_max], t.[team_priority_frequency],
    t.[team_leader_phone], t.[team_leader_out_of_group], t.[team_leader_name], t.[info], y.[roster_project_id]
FROM [tbl_roster_team] t
JOIN [tbl_roster_duty] y ON y.[duty_id] = t.[duty_id]
WHERE t.[team_priority_frequency] > 0
ORDER BY t.[team_priority_frequency] DESC, t.[position], t.[team_id];

-- The members of a team.
CREATE VIEW [qry_roster_load_people_team] AS
SELECT m.[team_id], m.[team_leader], r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display],
    r.[add_family], r.[substitute], r.[Sunday], r.[Monday], r.[Tuesday], r.[Wednesday], r.[Thursday], r.[Friday],
    r.[Saturday], r.[absent_day], r.[absent_1st], r.[absent_2nd], r.[absent_3rd], r.[absent_4th], r.[absent_5th],
    r.[every_week], r.[every_day], r.[every_start], r.[every_Sunday], r.[every_Monday], r.[every_Tuesday],
    r.[every_Wednesday], r.[every_Thursday], r.[every_Friday], r.[every_Saturday], r.[people_max],
    r.[people_priority_frequency], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_team_setup] m
JOIN [tbl_roster_people] r ON r.[roster_people_id] = m.[roster_people_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY r.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_team_leader_setup] AS
SELECT m.[team_id], t.[duty_id], t.[team], m.[team_leader], t.[team_leader_out_of_group], m.[roster_people_id],
    r.[person_id], r.[position], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key]
FROM [tbl_roster_team_setup] m
JOIN [tbl_roster_team] t ON t.[team_id] = m.[team_id]
JOIN [tbl_roster_people] r ON r.[roster_people_id] = m.[roster_people_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY r.[position], r.[roster_people_id];

-- Leaders with the phones that can be taken over.
CREATE VIEW [qry_roster_team_leader_phone] AS
SELECT m.[team_id], m.[roster_people_id], r.[person_id], p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name],
    p.[Preferred_Name_hidden], t.[team_leader_phone], d.[mobile_phone], d.[mobile_hidden], a.[phone], a.[phone_hidden]
FROM [tbl_roster_team_setup] m
JOIN [tbl_roster_team] t ON t.[team_id] = m.[team_id]
JOIN [tbl_roster_people] r ON r.[roster_people_id] = m.[roster_people_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
LEFT JOIN [tbl_address] a ON a.[surname_id] = p.[Surname_ID]
WHERE m.[team_leader] <> 0;

-- Whom a person on a duty is associated with: the names are those of the other side.
CREATE VIEW [qry_roster_load_associate_people] AS
SELECT c.[roster_people_id], c.[to_be_connected], c.[position], r.[person_id], r.[duty_id], y.[duty],
    y.[roster_project_id], j.[roster_project], p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden]
FROM [tbl_roster_to_connected] c
JOIN [tbl_roster_people] r ON r.[roster_people_id] = c.[to_be_connected]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY c.[position], c.[to_be_connected];

CREATE VIEW [qry_roster_load_not_associate_people] AS
SELECT c.[roster_people_id], c.[not_to_be_connected], r.[person_id], r.[duty_id], y.[duty], y.[roster_project_id],
    j.[roster_project], p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name], p.[Preferred_Name_hidden],
    d.[other_surname], d.[surname_hidden]
FROM [tbl_roster_not_connected] c
JOIN [tbl_roster_people] r ON r.[roster_people_id] = c.[not_to_be_connected]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], r.[position], c.[not_to_be_connected];

-- Everybody who can be associated.
CREATE VIEW [qry_roster_load_people_association] AS
SELECT r.[roster_people_id], r.[position], r.[person_id], r.[duty_id], y.[duty], y.[roster_project_id],
    j.[roster_project], p.[Surname_ID], f.[surname], p.[Name], p.[preferred_name], p.[Preferred_Name_hidden],
    d.[other_surname], d.[surname_hidden]
FROM [tbl_roster_people] r
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
JOIN [tbl_roster_project] j ON j.[roster_project_id] = y.[roster_project_id]
ORDER BY j.[position], y.[position], r.[position], r.[roster_people_id];

-- Who asks for a person, on which duty, and when placed there.
CREATE VIEW [qry_roster_auto_build_associate] AS
SELECT c.[to_be_connected], c.[roster_people_id], c.[position], r.[duty_id], r.[person_id], b.[date_id], x.[date]
FROM [tbl_roster_to_connected] c
JOIN [tbl_roster_people] r ON r.[roster_people_id] = c.[roster_people_id]
LEFT JOIN [tbl_roster_build] b ON b.[roster_people_id] = c.[roster_people_id]
LEFT JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
ORDER BY c.[position], c.[roster_people_id];

-- When someone who must not serve with a person is placed, on whichever duty.
CREATE VIEW [qry_roster_not_allowed] AS
SELECT c.[roster_people_id], c.[not_to_be_connected], o.[person_id], p.[Surname_ID], f.[surname], p.[Name],
    p.[preferred_name], p.[Preferred_Name_hidden], r.[roster_people_id] AS [placed_people_id], r.[duty_id],
    b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_not_connected] c
JOIN [tbl_roster_people] o ON o.[roster_people_id] = c.[not_to_be_connected]
JOIN [tbl_people] p ON p.[person_id] = o.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
JOIN [tbl_roster_people] r ON r.[person_id] = o.[person_id]
JOIN [tbl_roster_build] b ON b.[roster_people_id] = r.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id];

-- Who is placed where and when.
CREATE VIEW [qry_roster_display_people] AS
SELECT y.[roster_project_id], r.[duty_id], b.[date_id], x.[date], r.[roster_people_id], r.[person_id], r.[position],
    r.[display], r.[add_family], r.[substitute], b.[team_memory1], b.[team_memory2], b.[team_memory3],
    b.[team_memory4], b.[team_memory5], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name],
    p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key], p.[position] AS [family_position]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
JOIN [tbl_roster_duty] y ON y.[duty_id] = r.[duty_id]
ORDER BY r.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_load_build] AS
SELECT b.[date_id], r.[duty_id], r.[roster_people_id], r.[person_id], r.[position], r.[display], r.[add_family],
    r.[substitute], b.[team_memory1], b.[team_memory2], b.[team_memory3], b.[team_memory4], b.[team_memory5],
    p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[preferred_name], p.[Preferred_Name_hidden],
    d.[other_surname], d.[surname_hidden],
    CASE WHEN d.[other_surname] IS NULL OR d.[surname_hidden] <> 0 THEN f.[surname] ELSE d.[other_surname] END
        AS [sort_surname],
    p.[sort_key]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_people] p ON p.[person_id] = r.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = r.[person_id]
ORDER BY r.[position], r.[roster_people_id];

CREATE VIEW [qry_roster_build_clear] AS
SELECT b.[date_id], r.[duty_id], b.[roster_people_id], r.[person_id], b.[team_memory1], b.[team_memory2],
    b.[team_memory3], b.[team_memory4], b.[team_memory5], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id];

CREATE VIEW [qry_roster_auto_build_history] AS
SELECT r.[duty_id], b.[roster_people_id], r.[person_id], b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id];

-- Teams once for each date, wherever they are named.
CREATE VIEW [qry_roster_auto_build_history_team] AS
SELECT r.[duty_id], b.[team_memory1] AS [team_id], b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
WHERE b.[team_memory1] > 0
UNION
SELECT r.[duty_id], b.[team_memory2] AS [team_id], b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
WHERE b.[team_memory2] > 0
UNION
SELECT r.[duty_id], b.[team_memory3] AS [team_id], b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
WHERE b.[team_memory3] > 0
UNION
SELECT r.[duty_id], b.[team_memory4] AS [team_id], b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
WHERE b.[team_memory4] > 0
UNION
SELECT r.[duty_id], b.[team_memory5] AS [team_id], b.[date_id], x.[roster_project_id], x.[date]
FROM [tbl_roster_build] b
JOIN [tbl_roster_people] r ON r.[roster_people_id] = b.[roster_people_id]
JOIN [tbl_roster_date] x ON x.[date_id] = b.[date_id]
WHERE b.[team_memory5] > 0;

CREATE VIEW [qry_roster_comment_duty_find] AS
SELECT c.[date_id], c.[duty_id], c.[comment], x.[date], x.[roster_project_id]
FROM [tbl_roster_comment] c
JOIN [tbl_roster_date] x ON x.[date_id] = c.[date_id];

-- The comments that a duty has had, to choose from.
CREATE VIEW [qry_roster_comment_duty_find2] AS
SELECT [duty_id], [comment], COUNT(*) AS [amount]
FROM [tbl_roster_comment]
GROUP BY [duty_id], [comment]
ORDER BY [comment];
