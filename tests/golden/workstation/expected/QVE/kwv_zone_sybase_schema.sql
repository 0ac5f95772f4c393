drop table KWX_Network_Zones
go

create table KWX_Network_Zones (
   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Name varchar(8) NULL,
   State varchar(255) NULL,
   Name4 varchar(255) NULL,
   Place varchar(255) NULL )
go

alter table KWX_Network_Zones add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )
go

drop view KWX_VNetwork_Zones
go

create view KWX_VNetwork_Zones
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Network_Zones.*
from
   COMPUTER_SYSTEM, KWX_Network_Zones
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Network_Zones.HARDWARE_SYSTEM_ID
go

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VNetwork_Zones')
go
