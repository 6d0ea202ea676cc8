-- Stored queries over roll, giving and weekly figures. Dates come newest first.

CREATE VIEW [Qry_roll_load_project] AS
SELECT [roll_project_id], [roll_project], [position] FROM [tbl_roll_project] ORDER BY [position], [roll_project_id];

CREATE VIEW [Qry_roll_load_dates] AS
SELECT [roll_date_id], [roll_date], [roll_project_id] FROM [tbl_roll_date]
ORDER BY [roll_date] DESC, [roll_date_id] DESC;

CREATE VIEW [qry_roll_load_attendance] AS
SELECT d.[roll_project_id], d.[roll_date_id], d.[roll_date], a.[person_id], a.[Attendance]
FROM [tbl_roll_date] d
JOIN [tbl_roll_attendance] a ON a.[roll_date_id] = d.[roll_date_id];

-- Which families have been marked when: what leaves people out because of their family.
CREATE VIEW [qry_roll_output_ignore] AS
SELECT p.[Surname_ID], d.[roll_project_id], d.[roll_date_id], d.[roll_date], a.[person_id], a.[Attendance]
FROM [tbl_roll_date] d
JOIN [tbl_roll_attendance] a ON a.[roll_date_id] = d.[roll_date_id]
JOIN [tbl_people] p ON p.[person_id] = a.[person_id];

CREATE VIEW [Qry_roll_lookback_visitors] AS
SELECT d.[roll_project_id], d.[roll_date_id], d.[roll_date], v.[service_id], v.[visitors]
FROM [tbl_roll_date] d
JOIN [tbl_roll_visitors] v ON v.[roll_date_id] = d.[roll_date_id];

-- Every date with its note, or with none.
CREATE VIEW [Qry_roll_memo] AS
SELECT d.[roll_date_id], d.[roll_project_id], d.[roll_date], m.[Notes]
FROM [tbl_roll_date] d
LEFT JOIN [tbl_roll_memo] m ON m.[roll_date_id] = d.[roll_date_id]
ORDER BY d.[roll_date] DESC, d.[roll_date_id] DESC;

-- Holders of giving numbers. The numbers have no leading zeros, so the shorter is the smaller.
CREATE VIEW [Qry_finance_pin_order] AS
SELECT n.[person_id], n.[personal_pin], p.[Surname_ID], f.[surname], p.[Name], f.[Primary_name], p.[position],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden],
    p.[Active], p.[Decease], p.[Privacy], p.[Prospect], p.[archive], p.[contact], f.[Condition], p.[sort_key]
FROM [tbl_pin] n
JOIN [tbl_people] p ON p.[person_id] = n.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = n.[person_id]
WHERE n.[personal_pin] IS NOT NULL
ORDER BY length(n.[personal_pin]), n.[personal_pin];

CREATE VIEW [qry_pin_look_up_pin] AS
SELECT n.[person_id], n.[personal_pin], p.[Surname_ID], f.[surname], p.[Name],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden]
FROM [tbl_pin] n
JOIN [tbl_people] p ON p.[person_id] = n.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = n.[person_id]
WHERE n.[personal_pin] IS NOT NULL
ORDER BY length(n.[personal_pin]), n.[personal_pin];

CREATE VIEW [qry_pin_look_up_surname] AS
SELECT n.[person_id], n.[personal_pin], p.[Surname_ID], f.[surname], p.[Name],
    p.[preferred_name], p.[Preferred_Name_hidden], d.[other_surname], d.[surname_hidden]
FROM [tbl_pin] n
JOIN [tbl_people] p ON p.[person_id] = n.[person_id]
JOIN [tbl_surname] f ON f.[Surname_ID] = p.[Surname_ID]
LEFT JOIN [tbl_personal_details] d ON d.[person_id] = n.[person_id]
WHERE n.[personal_pin] IS NOT NULL
ORDER BY f.[sort_key], f.[Primary_name], f.[Surname_ID], p.[position];

CREATE VIEW [Qry_finance_load_project] AS
SELECT [finance_project_id], [finance_project], [position] FROM [tbl_finance_project]
ORDER BY [position], [finance_project_id];

CREATE VIEW [Qry_finance_load_dates] AS
SELECT [finance_date_id], [finance_date], [finance_project_id], [control_total] FROM [tbl_finance_date]
ORDER BY [finance_date] DESC, [finance_date_id] DESC;

CREATE VIEW [Qry_finance_individual_analysis] AS
SELECT d.[finance_project_id], d.[finance_date_id], d.[finance_date], a.[person_id], a.[Data]
FROM [tbl_finance_date] d
JOIN [tbl_finance_data] a ON a.[finance_date_id] = d.[finance_date_id];

CREATE VIEW [Qry_finance_memo] AS
SELECT d.[finance_date_id], d.[finance_project_id], d.[finance_date], m.[Notes]
FROM [tbl_finance_date] d
LEFT JOIN [tbl_finance_memo] m ON m.[finance_date_id] = d.[finance_date_id]
ORDER BY d.[finance_date] DESC, d.[finance_date_id] DESC;

CREATE VIEW [Qry_weekly_load_project] AS
SELECT [weekly_project_id], [weekly_project], [position] FROM [tbl_weekly_project]
ORDER BY [position], [weekly_project_id];

CREATE VIEW [Qry_weekly_load_dates] AS
SELECT [weekly_date_id], [weekly_date], [weekly_project_id] FROM [tbl_weekly_date]
ORDER BY [weekly_date] DESC, [weekly_date_id] DESC;

-- The categories of a project, those of attendance first, each kind in its own order.
CREATE VIEW [qry_weekly_load_groups] AS
SELECT [weekly_project_id], [group_type], [group], [group_id], [position] FROM [tbl_weekly_group]
ORDER BY [group_type], [position], [group_id];

CREATE VIEW [qry_weekly_load] AS
SELECT g.[weekly_project_id], p.[weekly_project], g.[group_id], g.[group], g.[group_type], g.[position]
FROM [tbl_weekly_group] g
JOIN [tbl_weekly_project] p ON p.[weekly_project_id] = g.[weekly_project_id]
ORDER BY g.[group_type], g.[position], g.[group_id];

CREATE VIEW [Qry_weekly_output_anlaysis] AS
SELECT d.[weekly_project_id], d.[weekly_date_id], d.[weekly_date], g.[group_id], g.[group], g.[group_type],
    g.[position], a.[amount]
FROM [tbl_weekly_date] d
JOIN [tbl_weekly_amount] a ON a.[date_id] = d.[weekly_date_id]
JOIN [tbl_weekly_group] g ON g.[group_id] = a.[group_id];

CREATE VIEW [Qry_weekly_memo] AS
SELECT d.[weekly_date_id], d.[weekly_project_id], d.[weekly_date], m.[Notes]
FROM [tbl_weekly_date] d
LEFT JOIN [tbl_weekly_memo] m ON m.[weekly_date_id] = d.[weekly_date_id]
ORDER BY d.[weekly_date] DESC, d.[weekly_date_id] DESC;
